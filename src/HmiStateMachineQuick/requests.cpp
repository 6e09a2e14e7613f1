#include <HmiStateMachineQuick/requests.h>

#include <HmiStateMachineQuick/internal/log.h>

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QJSValue>

namespace HmiStateMachine {

namespace {

constexpr int maximumDepth = 255; // what a back event can carry

#ifdef QT_NO_DEBUG
constexpr bool debugBuild = false;
#else
constexpr bool debugBuild = true;
#endif

// An object literal arrives as a script value, with which the flow could do nothing.
QVariant plain(const QVariant &data)
{
    return data.userType() == qMetaTypeId<QJSValue>() ? data.value<QJSValue>().toVariant() : data;
}

void post(QEvent *event)
{
    StateMachine::instance()->postEvent(event);
}

bool isView(const QString &id)
{
    return NamedState::stateForName(id) || HmiViewState::stateForTarget(id);
}

} // namespace

Requests::Requests(QObject *parent) : QObject(parent), m_checksIds(debugBuild)
{
}

Requests::~Requests() = default;

bool Requests::checksIds() const
{
    return m_checksIds;
}

void Requests::setChecksIds(bool on)
{
    if (on != m_checksIds) {
        m_checksIds = on;
        Q_EMIT checksIdsChanged();
    }
}

QVariantMap Requests::keys() const
{
    return m_keys;
}

void Requests::setKeys(const QVariantMap &codes)
{
    if (codes != m_keys) {
        m_keys = codes;
        Q_EMIT keysChanged();
    }
}

void Requests::view(const QString &id, const QVariant &data)
{
    warnUnless(isView(id), QStringLiteral("state or view"), id);
    Q_EMIT requested(QStringLiteral("view"), id, plain(data));
    post(new HmiViewEvent(id, plain(data)));
}

void Requests::back(int depth, const QString &target)
{
    if (depth < 0 || depth > maximumDepth) {
        warn(QStringLiteral("a back depth lies from 0 to %1, not at %2")
                 .arg(maximumDepth)
                 .arg(depth));
        return;
    }
    warnUnless(target.isEmpty() || isView(target), QStringLiteral("state or view"), target);
    Q_EMIT requested(QStringLiteral("back"), target, depth);
    post(new HmiBackEvent(static_cast<unsigned char>(depth), target));
}

void Requests::popup(const QString &id, const QVariant &data)
{
    const PopupState *popup = PopupState::stateForTarget(id);
    warnUnless(popup, QStringLiteral("popup"), id);
    Q_EMIT requested(QStringLiteral("popup"), id, plain(data));
    post(new PopupEvent(popup ? QString(popup->name()) : id, plain(data)));
}

void Requests::dismiss(const QString &id)
{
    const PopupState *popup = PopupState::stateForTarget(id);
    warnUnless(popup, QStringLiteral("popup"), id);
    Q_EMIT requested(QStringLiteral("dismiss"), id, QVariant());
    const QString target = popup ? popup->dismissEventIdentifier()
                                 : id + PopupDismissTransition::dismissEventSigniture;
    if (target.isEmpty()) {
        warn(QStringLiteral("the popup \"%1\" cannot be dismissed").arg(id));
        return;
    }
    post(new PopupEvent(target, QVariant()));
}

void Requests::dismissAny()
{
    Q_EMIT requested(QStringLiteral("dismissAny"), QString(), QVariant());
    post(new PopupEvent(PopupDismissTransition::dismissEventWildCard, QVariant()));
}

void Requests::event(const QString &name, const QVariant &data)
{
    Q_EMIT requested(QStringLiteral("event"), name, plain(data));
    post(new HmiEvent(name, plain(data)));
}

// Without a code there is nothing to emit.
void Requests::key(const QString &name, int status)
{
    const auto code = m_keys.constFind(name);
    if (code == m_keys.constEnd()) {
        warnUnless(false, QStringLiteral("key"), name);
        return;
    }
    Q_EMIT requested(QStringLiteral("key"), name, status);
    Q_EMIT keyChanged(code->toInt(), status);
}

void Requests::warn(const QString &text)
{
    qCWarning(hmistatemachinequick, "%s", qUtf8Printable(text));
    Q_EMIT warned(text);
}

void Requests::warnUnless(bool known, const QString &what, const QString &id)
{
    if (!known && m_checksIds) {
        warn(QStringLiteral("there is no %1 named \"%2\"").arg(what, id));
    }
}

} // namespace HmiStateMachine
