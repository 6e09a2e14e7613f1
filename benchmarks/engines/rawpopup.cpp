#include "rawpopup.h"

#include "rawevents.h"

#include <HmiStateMachine/named/viewstatetarget.h>

#include <QLoggingCategory>
#include <QSignalTransition>
#include <QStateMachine>

namespace Raw {

namespace {

Q_LOGGING_CATEGORY(popups, "benchmark.popups")

QString dismissSuffix()
{
    return QStringLiteral("_Dismiss");
}

} // namespace

PopupLayer::PopupLayer(HmiStateMachine::ViewStateTarget &layer, QState *parent)
    : QState(parent), m_layer(layer), m_quiet(new QState(this))
{
    setInitialState(m_quiet);
    connect(m_quiet, &QState::entered, this, &PopupLayer::requestReturn);
    new PopupTransition(this);
    new WaitingDismissTransition(this);
    auto *resetTransition = new QSignalTransition(this, SIGNAL(reset()), this);
    resetTransition->setTransitionType(QAbstractTransition::InternalTransition);
    resetTransition->setTargetState(m_quiet);
    connect(&layer, &HmiStateMachine::ViewStateTarget::activeDomainChanged, this,
            &PopupLayer::followDomain);
    connect(&layer, &HmiStateMachine::ViewStateTarget::activeViewChanged, this,
            &PopupLayer::followView);
}

void PopupLayer::enter(Popup *popup)
{
    m_front = popup;
    m_returns.append(popup->name());
}

bool PopupLayer::isProhibited(const QString &front, const QString &requested) const
{
    return m_prohibited.value(qMakePair(front, requested), false);
}

void PopupLayer::requestReturn()
{
    if (!m_returns.isEmpty()) {
        machine()->postEvent(new PopupEvent(m_returns.takeLast(), true, QVariant()));
    }
}

// Domains and views block no popup here: there are no lists of blocked ones.
void PopupLayer::followDomain(int newDomain, int oldDomain)
{
    Q_UNUSED(newDomain)
    Q_UNUSED(oldDomain)
}

void PopupLayer::followView(const QString &newView, const QString &oldView)
{
    Q_UNUSED(newView)
    Q_UNUSED(oldView)
}

PopupTransition::PopupTransition(PopupLayer *source) : QAbstractTransition(source), m_popups(source)
{
    // Not to leave and enter the layer itself with every popup.
    setTransitionType(InternalTransition);
}

bool PopupTransition::eventTest(QEvent *event)
{
    if (event->type() != PopupEventType) {
        return false;
    }
    Popup *popup = m_popups->find(static_cast<PopupEvent *>(event)->target);
    Popup *front = m_popups->front();
    if (!popup || popup == front
        || (front && m_popups->isProhibited(front->name(), popup->name()))) {
        return false;
    }
    const auto stacked = m_popups->layer().stackedPopups();
    for (const QString &name : stacked) {
        if (m_popups->isProhibited(name, popup->name())) {
            return false;
        }
    }
    setTargetState(popup);
    m_popups->layer().preparePopup(popup->name(), false);
    return true;
}

void PopupTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
}

WaitingDismissTransition::WaitingDismissTransition(PopupLayer *source)
    : QAbstractTransition(source), m_popups(source)
{
}

bool WaitingDismissTransition::eventTest(QEvent *event)
{
    if (event->type() != PopupEventType) {
        return false;
    }
    const QString &target = static_cast<PopupEvent *>(event)->target;
    if (!target.endsWith(dismissSuffix())) {
        return false;
    }
    Popup *popup = m_popups->find(target.chopped(dismissSuffix().size()));
    if (popup && popup != m_popups->front() && m_popups->willReturn(popup->name())) {
        popup->giveUp();
    }
    return false;
}

void WaitingDismissTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
}

DismissTransition::DismissTransition(Popup *source, PopupLayer *popups)
    : QAbstractTransition(source), m_popup(source)
{
    setTargetState(popups->quiet());
}

bool DismissTransition::eventTest(QEvent *event)
{
    if (event->type() != PopupEventType
        || static_cast<PopupEvent *>(event)->target != m_popup->dismissName()) {
        return false;
    }
    m_popup->giveUp();
    return true;
}

void DismissTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
}

Popup::Popup(const QString &name, int kind, PopupLayer *popups)
    : QState(popups), m_popups(popups), m_name(name), m_dismissName(name + dismissSuffix()),
      m_kind(kind)
{
    setObjectName(name);
    popups->add(name, this);
    new DismissTransition(this, popups);
}

void Popup::show()
{
    m_popups->layer().requestPopupShow(m_name, m_kind, m_instanceData);
    m_popups->layer().unstackPopup(m_name);
    // What qCWarning() is made of, which Clang takes for an extension of GCC's.
    if (popups().isWarningEnabled()) {
        QMessageLogger(QT_MESSAGELOG_FILE, QT_MESSAGELOG_LINE, QT_MESSAGELOG_FUNC,
                       popups().categoryName())
                .warning()
            << "Popup shown:" << m_name;
    }
}

void Popup::hide()
{
    m_popups->layer().requestPopupHide(m_name, !m_popups->willReturn(m_name));
    m_popups->layer().unstackPopup(m_name);
}

void Popup::giveUp()
{
    m_popups->giveUp(m_name);
    hide();
}

void Popup::onEntry(QEvent *event)
{
    m_popups->enter(this);
    if (event->type() == PopupEventType) {
        const QVariant &data = static_cast<PopupEvent *>(event)->data;
        if (data.isValid()) {
            m_instanceData.insert(QStringLiteral("eventData"), data);
        }
    }
    show();
}

void Popup::onExit(QEvent *event)
{
    Q_UNUSED(event)
    m_popups->leave();
    hide();
}

} // namespace Raw
