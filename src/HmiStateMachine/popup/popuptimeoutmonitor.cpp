#include <HmiStateMachine/popup/popuptimeoutmonitor.h>

#include <HmiStateMachine/popup/popupstate.h>

#include <QTimer>
#include <QVariant>

namespace HmiStateMachine {

namespace {

QString monitorKey()
{
    return QStringLiteral("timeoutMonitor");
}

} // namespace

PopupTimeoutMonitor::PopupTimeoutMonitor(int tickInterval, PopupState *popup)
    : QObject(popup), m_popup(popup), m_tickTimer(new QTimer(this))
{
    m_tickTimer->setInterval(tickInterval);
    connect(m_tickTimer, &QTimer::timeout, this, &PopupTimeoutMonitor::timeRemainingChanged);
    if (!popup) {
        return;
    }
    popup->addInstanceData(monitorKey(), QVariant::fromValue(this));
    connect(popup, &QAbstractState::entered, this, &PopupTimeoutMonitor::startMonitoring);
    connect(popup, &PopupState::alreadyActivated, this, &PopupTimeoutMonitor::startMonitoring);
    connect(popup, &QAbstractState::exited, m_tickTimer, &QTimer::stop);
}

PopupTimeoutMonitor::~PopupTimeoutMonitor()
{
    // Null when the monitor goes with its popup.
    if (m_popup) {
        m_popup->removeInstanceData(monitorKey());
    }
}

void PopupTimeoutMonitor::setTimerTick(int interval)
{
    m_tickTimer->setInterval(interval);
}

int PopupTimeoutMonitor::timeRemaining() const
{
    return m_popup ? m_popup->autoDismissRemainingTime() : 0;
}

void PopupTimeoutMonitor::startMonitoring()
{
    if (m_popup && m_popup->autoDismissActive()) {
        m_tickTimer->start();
    } else {
        m_tickTimer->stop();
    }
}

} // namespace HmiStateMachine
