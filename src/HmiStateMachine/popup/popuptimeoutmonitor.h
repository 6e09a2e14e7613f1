#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>

#include <QObject>
#include <QPointer>

class QTimer;

namespace HmiStateMachine {

class PopupState;

/**
 * Lets a popup's view show how much of its auto-dismiss time is left.
 *
 * It stands in the popup's data under "timeoutMonitor", where the view finds it, and ticks while
 * the popup is active and dismisses itself.
 */
class HMISTATEMACHINE_EXPORT PopupTimeoutMonitor : public QObject
{
    Q_OBJECT
    Q_PROPERTY(int timeRemaining READ timeRemaining NOTIFY timeRemainingChanged)

public:
    /**
     * Ticks every @p tickInterval milliseconds. @p popup becomes the parent; without one nothing is
     * monitored.
     */
    PopupTimeoutMonitor(int tickInterval, PopupState *popup);
    ~PopupTimeoutMonitor() override;

    /** The interval of the ticks in milliseconds. */
    void setTimerTick(int interval);

    /** In milliseconds; 0 while no time runs. */
    int timeRemaining() const;

Q_SIGNALS:
    /** With every tick, whether or not the value is another one. */
    void timeRemainingChanged();

public Q_SLOTS:
    /** Ticks from now when the popup dismisses itself, and not any more when it does not. */
    void startMonitoring();

private:
    Q_DISABLE_COPY(PopupTimeoutMonitor)

    QPointer<PopupState> m_popup;
    QTimer *m_tickTimer;
};

} // namespace HmiStateMachine
