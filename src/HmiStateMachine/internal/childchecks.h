#pragma once

#include <QObject>
#include <QVector>

namespace HmiStateMachine {

class NamedState;

/**
 * The states of one thread that have to look at their children again as soon as its event loop
 * runs: with one posted event for all of them, as a flow is built of thousands of states.
 *
 * A state is noted at most once and remembers its place, from which it can be taken at once.
 */
class ChildChecks : public QObject // clazy:exclude=missing-qobject-macro (it has no signals)
{
public:
    /** Those of the calling thread; they go when it ends. */
    static ChildChecks &ofThisThread();

    /** The states that are left are not looked at any more. */
    ~ChildChecks() override;

    void add(NamedState *state);

    /** Nothing when @p state is not noted here, as after the end of the thread that noted it. */
    void remove(NamedState *state);

private:
    ChildChecks();
    Q_DISABLE_COPY(ChildChecks)

    void run();

    QVector<NamedState *> m_states; // null where one has been taken away
    bool m_posted = false;
};

} // namespace HmiStateMachine
