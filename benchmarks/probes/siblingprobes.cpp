#include "siblingprobes.h"

#include "keysource.h"
#include "probe.h"

#include <HmiStateMachine/hmi/hmistate.h>
#include <HmiStateMachine/named/keysignaltransition.h>

#include <QCoreApplication>

namespace {

using HmiStateMachine::HmiState;
using HmiStateMachine::KeySignalTransition;

constexpr int theKey = 1;

KeySignalTransition *addKey(KeySource *keys, QState *source)
{
    return new KeySignalTransition(keys, SIGNAL(keyChanged(int, int)), theKey, keyPressed, source);
}

void press(KeySource &keys)
{
    Q_EMIT keys.keyChanged(theKey, keyPressed);
    QCoreApplication::sendPostedEvents();
}

void join(KeySignalTransition *transition)
{
    // Never the same one twice: a group keeps the priorities of its former members, too, and a key
    // source may come to lie where an earlier one has been.
    static int priority = 0;
    transition->makeParallelExclusive(++priority);
}

FlowShape flatShape(int views)
{
    FlowShape shape;
    shape.views = views;
    shape.keys = 1;
    return shape;
}

/** A key leads from one of two views to the other; every view of the flow is in the key's group. */
class OneActive : public Library::ShapeFlow
{
public:
    explicit OneActive(int members) : ShapeFlow(flatShape(members))
    {
        const auto views = viewParent()->findChildren<QState *>();
        for (QState *view : views) {
            auto *transition = view->findChild<KeySignalTransition *>();
            transition->setTargetState(view == views.first() ? views.at(1) : views.first());
            join(transition);
        }
    }

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            Q_EMIT keys().keyChanged(0, keyPressed);
            QCoreApplication::sendPostedEvents();
        }
    }
};

enum class Grouping { None, Group };

/** A key that every one of several parallel regions would take. */
class AllActive : public LibraryFlow
{
public:
    AllActive(int regions, Grouping grouping)
        : m_parallel(new HmiState(QStringLiteral("Parallel"), &machine()))
    {
        m_parallel->setChildMode(QState::ParallelStates);
        for (int i = 0; i < regions; ++i) {
            auto *region = new HmiState(QStringLiteral("Region%1").arg(i), m_parallel);
            KeySignalTransition *transition = addKey(&m_keys, region);
            if (grouping == Grouping::Group) {
                join(transition);
            }
        }
        start(m_parallel);
    }
    ~AllActive() override
    {
        stop();
        delete m_parallel;
    }

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            press(m_keys);
        }
    }

private:
    KeySource m_keys;
    HmiState *m_parallel;
};

/** One operation is one more member of a group; as many as there are operations at a time. */
class Joining : public LibraryFlow
{
public:
    void before(int operations) override
    {
        m_source = std::make_unique<QState>();
        for (int i = 0; i < operations; ++i) {
            m_members.append(addKey(&m_keys, m_source.get()));
        }
    }

    void run(int operations) override
    {
        Q_UNUSED(operations)
        for (KeySignalTransition *member : qAsConst(m_members)) {
            join(member);
        }
    }

    void after() override
    {
        m_members.clear();
        m_source.reset();
    }

private:
    KeySource m_keys;
    std::unique_ptr<QState> m_source;
    QVector<KeySignalTransition *> m_members;
};

QVector<Workload> joiningProbes()
{
    QVector<Workload> result;
    for (int members : {10, 100, 1000}) {
        Workload workload = probe<Joining>(
            Engine::Library, QStringLiteral("P-siblings-join/%1").arg(members),
            QStringLiteral("one of %1 transitions joins a sibling group").arg(members), oneLayout);
        workload.timed = members;
        workload.counted = members;
        result.append(workload);
    }
    return result;
}

} // namespace

QVector<Workload> siblingProbes()
{
    const auto engine = Engine::Library;
    return probes<OneActive>(engine, QStringLiteral("P-siblings"),
                             QStringLiteral("a key, its sibling group has %1 members, one active"),
                             oneLayout, {10, 100, 1000})
        + probes<AllActive>(engine, QStringLiteral("P-siblings-active"),
                            QStringLiteral("a key that %1 regions take, in one sibling group"),
                            fewLayouts, {2, 4, 8, 16}, Grouping::Group)
        + probes<AllActive>(engine, QStringLiteral("P-siblings-none"),
                            QStringLiteral("a key that %1 regions take, without a group"),
                            fewLayouts, {2, 4, 8, 16}, Grouping::None)
        + joiningProbes();
}
