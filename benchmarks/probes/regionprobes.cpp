#include "regionprobes.h"

#include "probe.h"
#include "stepflow.h"

namespace {

/** A state of parallel regions, each with two states of which one is active. */
class Regions : public StepFlow
{
protected:
    Regions(int regions, int stepsPerEvent)
        : StepFlow(stepsPerEvent), m_around(new QState(&machine()))
    {
        m_parallel = new QState(QState::ParallelStates, m_around);
        m_around->setInitialState(m_parallel);
        for (int i = 0; i < regions; ++i) {
            auto *region = new QState(m_parallel);
            auto *first = new QState(region);
            new QState(region);
            region->setInitialState(first);
        }
    }

    static QList<QState *> childStates(QState *state)
    {
        return state->findChildren<QState *>(QString(), Qt::FindDirectChildrenOnly);
    }
    QList<QState *> regions() const { return childStates(m_parallel); }
    void link(QState *region) { addSteps(childStates(region).first(), childStates(region).last()); }

    QState *m_around;
    QState *m_parallel;
};

/** The event moves one region; the others stay as they are. */
class OneMoves : public Regions
{
public:
    explicit OneMoves(int count) : Regions(count, 1)
    {
        link(regions().first());
        start(m_around);
    }
};

/** The event moves every region. */
class AllMove : public Regions
{
public:
    explicit AllMove(int count) : Regions(count, count)
    {
        const auto all = regions();
        for (QState *region : all) {
            link(region);
        }
        start(m_around);
    }
};

/** The event leaves the whole and enters it again. */
class LeftAndEntered : public Regions
{
public:
    explicit LeftAndEntered(int count) : Regions(count, 1)
    {
        addStep(childStates(regions().first()).first(), m_parallel);
        start(m_around);
    }
};

/** Nothing takes the event, and the transitions on the state around the regions have their say. */
class Surrounded : public Regions
{
public:
    Surrounded(int count, int transitions) : Regions(count, 0)
    {
        for (int i = 0; i < transitions; ++i) {
            addIdle(m_around);
        }
        start(m_around);
    }
};

template <typename Probe, typename... Arguments>
QVector<Workload> inSizes(const QString &family, const QString &title, Arguments... arguments)
{
    return probes<Probe>(Engine::Raw, family, title, fewLayouts, {1, 2, 4, 8, 16, 32},
                         arguments...);
}

} // namespace

QVector<Workload> regionProbes()
{
    constexpr int transitions = 20;
    return inSizes<OneMoves>(QStringLiteral("P-regions"),
                             QStringLiteral("a step in one of %1 parallel regions"))
        + inSizes<AllMove>(QStringLiteral("P-regions-all"),
                           QStringLiteral("a step in each of %1 parallel regions"))
        + inSizes<LeftAndEntered>(QStringLiteral("P-regions-left"),
                                  QStringLiteral("%1 parallel regions left and entered again"))
        + inSizes<Surrounded>(
               QStringLiteral("P-regions-around"),
               QStringLiteral("an event that nothing takes, 20 transitions around %1 regions"),
               transitions);
}
