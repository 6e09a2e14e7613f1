#include "treeprobes.h"

#include "probe.h"
#include "stepflow.h"

namespace {

/** A state @p depth levels below @p parent, the states between being one another's initial state.
 */
QState *innermost(QState *parent, int depth)
{
    for (int level = 0; level < depth; ++level) {
        auto *state = new QState(parent);
        if (level > 0) {
            parent->setInitialState(state);
        }
        parent = state;
    }
    return parent;
}

/** The event leads to a neighbour; all states around them stay entered. */
class Neighbours : public StepFlow
{
public:
    explicit Neighbours(int depth)
    {
        QState *parent = innermost(&machine(), depth - 1);
        addPair(parent);
        start(machine().findChild<QState *>(QString(), Qt::FindDirectChildrenOnly));
    }
};

/** The event leads to the other end of the tree: all levels are left and entered. */
class FarApart : public StepFlow
{
public:
    explicit FarApart(int depth)
    {
        QState *one = innermost(&machine(), depth);
        QState *other = innermost(&machine(), depth);
        addSteps(one, other);
        start(machine().findChild<QState *>(QString(), Qt::FindDirectChildrenOnly));
    }
};

/** A transition from a group of states to one of them. */
class FromGroup : public StepFlow
{
public:
    FromGroup(int children, QAbstractTransition::TransitionType type)
    {
        auto *group = new QState(&machine());
        for (int i = 0; i < children; ++i) {
            new QState(group);
        }
        auto *first = group->findChild<QState *>();
        group->setInitialState(first);
        addStep(group, first)->setTransitionType(type);
        start(group);
    }
};

template <typename Probe, typename... Arguments>
QVector<Workload> inSizes(const QString &family, const QString &title,
                          std::initializer_list<int> sizes, Arguments... arguments)
{
    return probes<Probe>(Engine::Raw, family, title, oneLayout, sizes, arguments...);
}

} // namespace

QVector<Workload> treeProbes()
{
    return inSizes<Neighbours>(QStringLiteral("P-depth"),
                               QStringLiteral("a step to the neighbour, nested %1 deep"),
                               {1, 4, 16, 64})
        + inSizes<FarApart>(QStringLiteral("P-depth-apart"),
                            QStringLiteral("a step that leaves and enters %1 levels"),
                            {1, 4, 16, 64})
        + inSizes<FromGroup>(QStringLiteral("P-external"),
                             QStringLiteral("an external transition of a state with %1 children"),
                             {10, 100, 1000}, QAbstractTransition::ExternalTransition)
        + inSizes<FromGroup>(QStringLiteral("P-internal"),
                             QStringLiteral("an internal transition of a state with %1 children"),
                             {10, 100, 1000}, QAbstractTransition::InternalTransition);
}
