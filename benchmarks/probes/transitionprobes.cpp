#include "transitionprobes.h"

#include "keysource.h"
#include "probe.h"
#include "stepflow.h"

#include <QSignalTransition>

namespace {

enum class Kind { Event, Signal };

/** The event leads from one of two states to the other, each with more transitions on it. */
class OnState : public StepFlow
{
public:
    OnState(int transitions, Kind kind)
    {
        auto *one = new QState(&machine());
        auto *other = new QState(&machine());
        for (QState *state : {one, other}) {
            for (int i = 0; i < transitions; ++i) {
                if (kind == Kind::Signal) {
                    new QSignalTransition(&m_keys, SIGNAL(keyChanged(int, int)), state);
                } else {
                    addIdle(state);
                }
            }
        }
        addSteps(one, other); // behind the others, so that these are tested first
        start(one);
    }

private:
    KeySource m_keys;
};

/** The same, but the other transitions are on the state around the two. */
class OnParent : public StepFlow
{
public:
    explicit OnParent(int transitions)
    {
        auto *parent = new QState(&machine());
        addPair(parent);
        for (int i = 0; i < transitions; ++i) {
            addIdle(parent);
        }
        start(parent);
    }
};

/**
 * A transition on a state with many children while one of them is active: moved away and back
 * between the events, or left where it is.
 */
class OnGroup : public StepFlow
{
public:
    OnGroup(int children, bool moves) : m_group(new QState(&machine())), m_moves(moves)
    {
        addPair(m_group);
        for (int i = 2; i < children; ++i) {
            new QState(m_group);
        }
        m_elsewhere = new QState(&machine());
        m_transition = addIdle(m_group);
        start(m_group);
    }

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            if (m_moves) {
                move();
            }
            postStep();
        }
    }

private:
    void move()
    {
        QState *to = m_transition->sourceState() == m_group ? m_elsewhere : m_group;
        to->addTransition(m_transition);
    }

    QState *m_group;
    bool m_moves;
    QState *m_elsewhere;
    QAbstractTransition *m_transition;
};

template <typename Probe, typename... Arguments>
QVector<Workload> inSizes(const QString &family, const QString &title,
                          std::initializer_list<int> sizes, Arguments... arguments)
{
    return probes<Probe>(Engine::Raw, family, title, oneLayout, sizes, arguments...);
}

} // namespace

QVector<Workload> transitionProbes()
{
    return inSizes<OnState>(QStringLiteral("P-transitions"),
                            QStringLiteral("a step, %1 more transitions on each state"),
                            {0, 10, 100, 1000}, Kind::Event)
        + inSizes<OnState>(QStringLiteral("P-transitions-signal"),
                           QStringLiteral("a step, %1 signal transitions on each state"),
                           {0, 10, 100, 1000}, Kind::Signal)
        + inSizes<OnParent>(QStringLiteral("P-transitions-parent"),
                            QStringLiteral("a step, %1 more transitions on the parent"),
                            {0, 10, 100, 1000})
        + inSizes<OnGroup>(
               QStringLiteral("P-move"),
               QStringLiteral("a transition moved on or off a parent of %1, and a step"),
               {10, 100, 1000}, true)
        + inSizes<OnGroup>(QStringLiteral("P-move-kept"),
                           QStringLiteral("a transition kept on a parent of %1, and a step"),
                           {10, 100, 1000}, false);
}
