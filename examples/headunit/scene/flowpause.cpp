#include "flowpause.h"

#include <QAbstractEventDispatcher>
#include <QTimer>

#include <utility>

namespace headunit {

namespace {

QAbstractEventDispatcher *dispatcher()
{
    return QAbstractEventDispatcher::instance();
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
        if (m_remaining.contains(timer->timerId())) {
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
    const auto before = std::exchange(m_remaining, {});
    const auto timers = runningTimers();
    for (QTimer *timer : timers) {
        hold(timer, before.value(timer->timerId(), timer->interval()));
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
    if (timer->isSingleShot() || remaining == timer->interval()) {
        return;
    }
    auto *once = new QObject(timer);
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
