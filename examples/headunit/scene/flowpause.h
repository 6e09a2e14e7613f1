#pragma once

#include <QHash>
#include <QList>

class QObject;
class QTimer;

namespace headunit {

/**
 * Stops the flow's timers while a scene is drawn, which takes longer than nothing: in a scenario
 * time passes in the command "wait" and nowhere else, with a scene as without one.
 */
class FlowPause
{
public:
    /** Covers every timer below @p owners, which outlive this. */
    explicit FlowPause(const QList<QObject *> &owners);
    ~FlowPause();

    /** Lets the timers run on. */
    void end();

    /** Holds the timers where they were when the last pause ended: no time is to have passed. */
    void beginAgain();

    /** Holds the timers where they are. */
    void begin();

private:
    Q_DISABLE_COPY(FlowPause)

    void hold(QTimer *timer, int remaining);
    void resume(QTimer *timer, int remaining);
    QList<QTimer *> runningTimers() const;

    QList<QObject *> m_owners;
    QHash<int, int> m_remaining; // by timer id
    bool m_held = false;
};

} // namespace headunit
