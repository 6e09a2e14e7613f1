#include "lifecycle.h"

#include "machineflow.h"
#include "rawkey.h"
#include "rawview.h"
#include "sides.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/keysignaltransition.h>

namespace {

// Every view is one as flows have them: with instance data of the application, and a way back.
constexpr int instanceKeys = 3;

template <typename View> void addInstanceData(View *view)
{
    static const QString keys[instanceKeys] = {QStringLiteral("title"), QStringLiteral("source"),
                                               QStringLiteral("position")};
    for (int key = 0; key < instanceKeys; ++key) {
        view->addInstanceData(keys[key], key);
    }
}

enum class Phase { Build, Start, Destroy };

/** A group of views on bare Qt. */
class RawViews : public MachineFlow
{
public:
    explicit RawViews(int keys = 0) : m_keyCount(keys), m_screens(layer()) { }
    ~RawViews() override { delete m_group; }

protected:
    QState *buildGroup()
    {
        auto *group = new QState(&machine());
        QObject::connect(group, &QState::entered, &layer(),
                         &HmiStateMachine::ViewStateTarget::resetScreenPopupBehavior);
        return group;
    }
    QState *buildView(const QString &name)
    {
        auto *view = new Raw::View(m_screens, name, name, m_group);
        addInstanceData(view);
        view->handleBack();
        for (int key = 0; key < m_keyCount; ++key) {
            new Raw::KeyTransition(&m_keys, SIGNAL(keyChanged(int, int)), key, keyPressed, view);
        }
        return view;
    }

    QState *m_group = nullptr;

private:
    KeySource m_keys;
    int m_keyCount;
    Raw::Screens m_screens;
};

/** A group of views of the library, below a group with the popup behaviour given. */
class LibraryViews : public LibraryFlow
{
public:
    explicit LibraryViews(int keys = 0,
                          HmiStateMachine::HmiState::PopupBehavior behavior =
                              HmiStateMachine::HmiState::DefaultPopupBehavior)
        : m_keyCount(keys), m_behavior(behavior)
    {
    }
    ~LibraryViews() override { delete m_group; }

protected:
    QState *buildGroup()
    {
        auto *group = new HmiStateMachine::HmiState(QStringLiteral("Group"), &machine());
        group->setPopupBehavior(m_behavior);
        return group;
    }
    QState *buildView(const QString &name)
    {
        auto *view = new HmiStateMachine::HmiViewState(name, m_group);
        addInstanceData(view);
        view->setHandlesBackEvent(true);
        for (int key = 0; key < m_keyCount; ++key) {
            new HmiStateMachine::KeySignalTransition(&m_keys, SIGNAL(keyChanged(int, int)), key,
                                                     keyPressed, view);
        }
        return view;
    }

    QState *m_group = nullptr;

private:
    KeySource m_keys;
    int m_keyCount;
    HmiStateMachine::HmiState::PopupBehavior m_behavior;
};

/** One operation is one view in one phase of its life; the other phases are not measured. */
template <typename Base> class Lifecycle : public Base
{
public:
    template <typename... Arguments>
    explicit Lifecycle(Phase phase, const QStringList &names, Arguments... arguments)
        : Base(arguments...), m_phase(phase), m_names(names), m_parking(&this->machine())
    {
    }

    void before(int operations) override
    {
        this->m_group = this->buildGroup();
        if (m_phase != Phase::Build) {
            build(operations);
        }
    }

    void run(int operations) override
    {
        switch (m_phase) {
        case Phase::Build:
            build(operations);
            break;
        case Phase::Start:
            this->start(this->m_group);
            break;
        case Phase::Destroy:
            destroy();
            break;
        }
    }

    void after() override
    {
        if (m_phase == Phase::Start) {
            // A stopped machine still points to where it was: it must not be among what goes.
            this->stop();
            this->start(&m_parking);
            this->stop();
        }
        destroy();
    }

private:
    void build(int count)
    {
        QState *first = this->buildView(m_names.first());
        this->m_group->setInitialState(first);
        for (int i = 1; i < count; ++i) {
            this->buildView(m_names.at(i));
        }
    }

    void destroy()
    {
        delete this->m_group;
        this->m_group = nullptr;
    }

    Phase m_phase;
    QStringList m_names;
    QState m_parking;
};

QStringList viewNames(int count)
{
    FlowShape shape;
    shape.views = count;
    return shape.viewNames();
}

Workload lifecycle(const QString &id, const QString &title, Phase phase, int views, int keys = 0)
{
    const QStringList names = viewNames(views);
    return {QStringLiteral("W5/") + id,
            title,
            views,
            views,
            views,
            1,
            {side<Lifecycle<LibraryViews>>(Engine::Library, phase, names, keys),
             side<Lifecycle<RawViews>>(Engine::Raw, phase, names, keys)}};
}

Workload inheriting(int views)
{
    using HmiStateMachine::HmiState;
    const QStringList names = viewNames(views);
    return {QStringLiteral("W5/inheriting"),
            QStringLiteral("build a view state below one with popups off, %1 of them").arg(views),
            views,
            views,
            views,
            1,
            {side<Lifecycle<LibraryViews>>(Engine::Library, Phase::Build, names, 0,
                                           HmiState::PopupBehaviorOff),
             side<Lifecycle<RawViews>>(Engine::Raw, Phase::Build, names)}};
}

} // namespace

QVector<Workload> lifecycleWorkloads()
{
    constexpr int aFlow = 1000;
    constexpr int manyViews = 4000;
    constexpr int someKeys = 2;
    return {lifecycle(QStringLiteral("build"), QStringLiteral("build a view state"), Phase::Build,
                      aFlow),
            lifecycle(QStringLiteral("start"), QStringLiteral("start a machine, by the view state"),
                      Phase::Start, aFlow),
            lifecycle(QStringLiteral("destroy"), QStringLiteral("destroy a view state"),
                      Phase::Destroy, aFlow),
            lifecycle(QStringLiteral("build-keys"),
                      QStringLiteral("build a view state with two key transitions"), Phase::Build,
                      aFlow, someKeys),
            lifecycle(QStringLiteral("start-keys"),
                      QStringLiteral("start a machine of such, by the view state"), Phase::Start,
                      aFlow, someKeys),
            lifecycle(QStringLiteral("destroy-keys"), QStringLiteral("destroy such a view state"),
                      Phase::Destroy, aFlow, someKeys),
            lifecycle(QStringLiteral("default"),
                      QStringLiteral("build a view state, %1 of them").arg(manyViews), Phase::Build,
                      manyViews),
            inheriting(manyViews)};
}
