#include <HmiStateMachineQuick/screenhost.h>

#include <HmiStateMachineQuick/hostattached.h>
#include <HmiStateMachineQuick/internal/hosteditem.h>
#include <HmiStateMachineQuick/internal/log.h>
#include <HmiStateMachineQuick/quickviewstatetarget.h>
#include <HmiStateMachineQuick/requests.h>
#include <HmiStateMachineQuick/viewcomponent.h>

#include <QQmlContext>
#include <QQmlEngine>
#include <QTimer>

namespace HmiStateMachine {

namespace {

// The screen behind moves by less than the one in front, as paper would that lies beneath.
constexpr qreal shareBehind = 0.3;
constexpr int warningZ = 1000;
constexpr int warningMs = 4000; // two short lines are read in that time

void moveScreen(SceneHost::Effect effect, QQuickItem *item, qreal position)
{
    switch (effect) {
    case SceneHost::Slide:
        item->setX(item->width() * (position < 0 ? position * shareBehind : position));
        break;
    case SceneHost::Fade:
        item->setOpacity(1 - qAbs(position));
        break;
    case SceneHost::NoEffect:
        break;
    }
}

} // namespace

ScreenHost::ScreenHost(QQuickItem *parent) : SceneHost(Slide, parent)
{
    setClip(true);
}

ScreenHost::~ScreenHost()
{
    if (target()) {
        ScreenHost::detach(target()); // its own: what derives from it is gone
    }
}

HostAttached *ScreenHost::qmlAttachedProperties(QObject *object)
{
    return new HostAttached(object);
}

int ScreenHost::keep() const
{
    return m_keep;
}

void ScreenHost::setKeep(int number)
{
    if (number == m_keep) {
        return;
    }
    m_keep = number;
    trimKept();
    Q_EMIT keepChanged();
}

QQuickItem *ScreenHost::currentItem() const
{
    return m_current ? m_current->item() : nullptr;
}

void ScreenHost::presentView(const QString &viewId, bool back)
{
    if (!target()) {
        return; // nobody asks but a target
    }
    if (m_pending) {
        m_pending->discard();
        m_pending = nullptr;
    }
    if (m_current && m_current->id() == viewId && !m_current->hasFailed()) {
        updateData();
        if (!m_current->isBusy()) {
            target()->reportViewShown(viewId);
        }
        busyChanged();
        return;
    }
    endEntry();
    m_pending = makeItem(viewId);
    if (m_pending->item()) {
        enter(back);
        return;
    }
    m_pending->load(dataOf(viewId), [this, back] { enter(back); });
    busyChanged();
}

bool ScreenHost::isBusy() const
{
    return m_pending || m_leaving;
}

void ScreenHost::attach(QuickViewStateTarget *target)
{
    connect(target, &QuickViewStateTarget::viewDataChanged, this, &ScreenHost::updateData);
    connect(target, &QuickViewStateTarget::activationDataChanged, this, &ScreenHost::updateData);
    connect(target->requests(), &Requests::warned, this, &ScreenHost::showWarning);
    target->setViewPresenter(this);
    if (!target->activeView().isEmpty()) {
        presentView(target->activeView(), false);
    }
}

void ScreenHost::detach(QuickViewStateTarget *target)
{
    if (target->requests()) {
        target->requests()->disconnect(this);
    }
    if (target->viewPresenter() == this) {
        target->setViewPresenter(nullptr);
    }
}

void ScreenHost::clear()
{
    const bool shown = m_current;
    for (HostedItem *item : {m_pending, m_current, m_leaving}) {
        if (item) {
            item->discard();
        }
    }
    m_pending = nullptr;
    m_current = nullptr;
    m_leaving = nullptr;
    for (HostedItem *kept : qAsConst(m_kept)) {
        kept->discard();
    }
    m_kept.clear();
    if (shown) {
        Q_EMIT currentItemChanged();
    }
}

HostedComponent *ScreenHost::declaredComponent(const QString &id) const
{
    const auto declared = findChildren<ViewComponent *>(QString(), Qt::FindDirectChildrenOnly);
    for (ViewComponent *component : declared) {
        if (component->viewId() == id) {
            return component;
        }
    }
    return nullptr;
}

HostedItem *ScreenHost::makeItem(const QString &viewId)
{
    for (HostedItem *kept : qAsConst(m_kept)) {
        if (kept->id() == viewId) {
            m_kept.removeOne(kept);
            kept->setProperties(dataOf(viewId));
            return kept;
        }
    }
    const HostedItem::Manner manner{
        [](QQuickItem *item) {
            return qobject_cast<HostAttached *>(qmlAttachedPropertiesObject<ScreenHost>(item));
        },
        [this](QQuickItem *item, qreal position) { moveScreen(effect(), item, position); }};
    return new HostedItem(viewId, manner, this);
}

QVariantMap ScreenHost::dataOf(const QString &viewId) const
{
    return {{QStringLiteral("viewId"), viewId},
            {QStringLiteral("viewData"), target()->viewData()},
            {QStringLiteral("activationData"), target()->activationData()}};
}

// The screen that is being left keeps what it had.
void ScreenHost::updateData()
{
    for (HostedItem *item : {m_current, m_pending}) {
        if (item && item->id() == target()->activeView()) {
            item->setProperties(dataOf(item->id()));
        }
    }
}

void ScreenHost::enter(bool back)
{
    m_leaving = m_current;
    m_current = m_pending;
    m_pending = nullptr;
    m_current->item()->setVisible(true);
    m_current->item()->setEnabled(true);
    m_current->item()->setZ(back ? 0 : 1);
    Q_EMIT currentItemChanged();
    if (!m_leaving || duration() <= 0) {
        m_current->jumpTo(0);
        endEntry();
        if (!m_current->hasFailed()) {
            target()->reportViewShown(m_current->id());
        }
        return;
    }
    m_leaving->item()->setEnabled(false);
    m_leaving->item()->setZ(back ? 1 : 0);
    m_current->jumpTo(back ? -1 : 1);
    if (!m_current->hasFailed()) {
        target()->reportViewAnimationStarted(m_current->id(),
                                             back ? QuickViewStateTarget::BackAnimation
                                                  : QuickViewStateTarget::ForwardAnimation);
    }
    m_leaving->moveTo(back ? 1 : -1, nullptr);
    m_current->moveTo(0, [this] {
        endEntry();
        if (!m_current->hasFailed()) {
            target()->reportViewShown(m_current->id());
        }
    });
    busyChanged();
}

// Also when another view is asked for before the animation has ended: then nothing is reported.
void ScreenHost::endEntry()
{
    if (m_current) {
        m_current->jumpTo(0);
    }
    dropLeaving();
    busyChanged();
}

void ScreenHost::dropLeaving()
{
    if (!m_leaving) {
        return;
    }
    HostedItem *left = m_leaving;
    m_leaving = nullptr;
    left->jumpTo(0);
    left->item()->setVisible(false);
    if (left->hasFailed()) {
        left->discard();
        return;
    }
    m_kept.prepend(left);
    trimKept();
}

void ScreenHost::trimKept()
{
    while (m_keep >= 0 && m_kept.size() > m_keep) {
        m_kept.takeLast()->discard();
    }
}

void ScreenHost::showWarning(const QString &text)
{
    delete m_banner;
    QQmlComponent component(qmlEngine(this),
                            QUrl(QStringLiteral("qrc:/HmiStateMachineQuick/WarningBanner.qml")));
    auto *banner = qobject_cast<QQuickItem *>(component.beginCreate(qmlContext(this)));
    if (!banner) {
        qCWarning(hmistatemachinequick, "no banner: %s", qUtf8Printable(component.errorString()));
        return;
    }
    m_banner = banner;
    banner->setProperty("text", text);
    banner->setZ(warningZ);
    banner->setParent(this);
    banner->setParentItem(this);
    component.completeCreate();
    QTimer::singleShot(warningMs, banner, &QObject::deleteLater);
}

void ScreenHost::busyChanged()
{
    if (target()) {
        target()->reportBusyChanged();
    }
}

} // namespace HmiStateMachine
