#include "flowpause.h"

#include <QAbstractEventDispatcher>
#include <QTimer>

namespace headunit {

namespace {

const QString restName = QStringLiteral("restOfInterval");

QAbstractEventDispatcher *dispatcher()
{
    return QAbstractEventDispatcher::instance();
}

// What a timer was started with; -1 while it is held. Its id does not tell whether it has been
// started anew: one that is given up is the next to be given away.
int registeredInterval(QTimer *timer)
{
    const auto registered = dispatcher()->registeredTimers(timer);
    for (const auto &info : registered) {
        if (info.timerId == timer->timerId()) {
            return info.interval;
        }
    }
    return -1;
}

// The timer itself does not notice, so its interval stays what it was.
void registerAnew(QTimer *timer, int milliseconds)
{
    dispatcher()->unregisterTimer(timer->timerId());
    dispatcher()->registerTimer(timer->timerId(), milliseconds, timer->timerType(), timer);
}

} // namespace

FlowPause::FlowPause(const QList<QObject *> &owners) : m_owners(owners)
{
}

// The owners' timers must not be left without a dispatcher.
FlowPause::~FlowPause()
{
    end();
}

void FlowPause::end()
{
    if (!m_held) {
        return;
    }
    m_held = false;
    const auto timers = runningTimers();
    for (QTimer *timer : timers) {
        const bool isHeld = registeredInterval(timer) < 0; // not stopped and started meanwhile
        if (isHeld && m_remaining.contains(timer->timerId())) {
            resume(timer, m_remaining.value(timer->timerId()));
        }
    }
}

void FlowPause::beginAgain()
{
    if (m_held) {
        return;
    }
    m_held = true;
    m_remaining.clear();
    const auto timers = runningTimers();
    for (QTimer *timer : timers) {
        hold(timer, registeredInterval(timer)); // the rest, when it is one of the last pause's
    }
}

void FlowPause::begin()
{
    if (m_held) {
        return;
    }
    m_held = true;
    m_remaining.clear();
    const auto timers = runningTimers();
    for (QTimer *timer : timers) {
        hold(timer, qMax(0, timer->remainingTime()));
    }
}

void FlowPause::hold(QTimer *timer, int remaining)
{
    m_remaining.insert(timer->timerId(), remaining);
    dispatcher()->unregisterTimer(timer->timerId());
}

// A timer that repeats has its whole interval again after the rest of this one.
void FlowPause::resume(QTimer *timer, int remaining)
{
    dispatcher()->registerTimer(timer->timerId(), remaining, timer->timerType(), timer);
    if (timer->isSingleShot() || remaining == timer->interval()
        || timer->findChild<QObject *>(restName, Qt::FindDirectChildrenOnly)) {
        return;
    }
    auto *once = new QObject(timer);
    once->setObjectName(restName);
    const int id = timer->timerId();
    QObject::connect(timer, &QTimer::timeout, once, [timer, once, id] {
        if (timer->timerId() == id) {
            registerAnew(timer, timer->interval());
        }
        delete once;
    });
}

QList<QTimer *> FlowPause::runningTimers() const
{
    QList<QTimer *> running;
    for (const QObject *owner : m_owners) {
        const auto timers = owner->findChildren<QTimer *>();
        for (QTimer *timer : timers) {
            if (timer->isActive()) {
                running.append(timer);
            }
        }
    }
    return running;
}

} // namespace headunit
