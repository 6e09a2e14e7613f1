#include "viewswitch.h"

#include "floorflow.h"
#include "scxmlflow.h"
#include "sides.h"

namespace {

/** One operation is one request for another view. */
template <typename Base> class ViewSwitch : public Base
{
public:
    using Base::Base;

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            m_next = nextIndex(m_next, this->screens().size());
            this->requestView(this->screens().at(m_next), i);
        }
    }

private:
    int m_next = 0;
};

class ScxmlViewSwitch : public ScxmlShapeFlow
{
public:
    using ScxmlShapeFlow::ScxmlShapeFlow;

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            m_next = nextIndex(m_next, viewCount());
            requestView(m_next, i);
        }
    }

private:
    int m_next = 0;
};

/** One operation is one event that nothing takes. */
template <typename Base> class IgnoredEvent : public Base
{
public:
    using Base::Base;

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            this->post(new QEvent(QEvent::Type(QEvent::User + 500)));
        }
    }
};

class ScxmlIgnoredEvent : public ScxmlShapeFlow
{
public:
    using ScxmlShapeFlow::ScxmlShapeFlow;

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            submit(QStringLiteral("nobody.takes.this"), QVariant());
        }
    }
};

/** One operation is eight views forward and eight back. */
template <typename Base> class ForwardAndBack : public Base
{
public:
    using Base::Base;

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            for (int step = 1; step < this->screens().size(); ++step) {
                this->requestView(this->screens().at(step), step);
            }
            for (int step = 1; step < this->screens().size(); ++step) {
                this->requestBack();
            }
        }
    }
};

constexpr int someViews = 10;

Workload flatSwitch(int views)
{
    FlowShape shape;
    shape.views = views;
    Workload result{QStringLiteral("W1/%1").arg(views),
                    QStringLiteral("view switch among %1 views").arg(views),
                    400,
                    200,
                    views,
                    1,
                    libraryAndRaw<ViewSwitch>(shape)};
    // Its cost grows with the number of views: with ten thousand it would take the whole run.
    constexpr int scxmlLimit = 1000;
    if (views <= scxmlLimit) {
        result.sides.append(side<ScxmlViewSwitch>(Engine::Scxml, shape));
    }
    result.sides.append(side<FloorViewSwitch>(Engine::Floor, shape));
    return result;
}

Workload switchByScreen(int views)
{
    FlowShape shape;
    shape.views = views;
    shape.byScreen = true;
    return {QStringLiteral("W1T/%1").arg(views),
            QStringLiteral("view switch by a screen id, %1 views").arg(views),
            400,
            200,
            views,
            1,
            libraryAndRaw<ViewSwitch>(shape)};
}

Workload layeredSwitch(int layers)
{
    FlowShape shape;
    shape.views = someViews;
    shape.layers = layers;
    const bool nested = layers > 1;
    return {nested ? QStringLiteral("W1N/%1").arg(layers) : QStringLiteral("W1L"),
            nested ? QStringLiteral("view switch in %1 nested layered states").arg(layers)
                   : QStringLiteral("view switch in a layered state"),
            nested ? 50 : 200,
            100,
            2 * someViews,
            severalLayouts,
            libraryAndRaw<ViewSwitch>(shape)};
}

Workload switchBesidePopups(int popups)
{
    FlowShape shape;
    shape.views = someViews;
    shape.layers = 1;
    shape.popups = popups;
    shape.popupsShownBefore = true;
    return {QStringLiteral("W1P/%1").arg(popups),
            QStringLiteral("view switch beside %1 popups shown before").arg(popups),
            200,
            100,
            2 * someViews,
            severalLayouts,
            libraryAndRaw<ViewSwitch>(shape)};
}

Workload switchWithKeys(int keys)
{
    FlowShape shape;
    shape.views = someViews;
    shape.keys = keys;
    return {QStringLiteral("W1K/%1").arg(keys),
            QStringLiteral("view switch, %1 key transitions on each view").arg(keys),
            100,
            50,
            2 * someViews,
            1,
            libraryAndRaw<ViewSwitch>(shape)};
}

Workload ignoredEvent()
{
    FlowShape shape;
    shape.views = someViews;
    Workload result{QStringLiteral("W1I"),
                    QStringLiteral("an event that nothing takes"),
                    1000,
                    500,
                    10,
                    1,
                    libraryAndRaw<IgnoredEvent>(shape)};
    result.sides.append(side<ScxmlIgnoredEvent>(Engine::Scxml, shape));
    return result;
}

Workload forwardAndBack()
{
    FlowShape shape;
    shape.views = 9; // the first, and eight steps away from it
    shape.back = true;
    return {QStringLiteral("W2"),
            QStringLiteral("eight views forward and eight back"),
            40,
            20,
            2,
            1,
            libraryAndRaw<ForwardAndBack>(shape)};
}

} // namespace

QVector<Workload> viewSwitchWorkloads()
{
    return {flatSwitch(10),         flatSwitch(40),          flatSwitch(100),
            flatSwitch(1000),       flatSwitch(10000),       layeredSwitch(1),
            switchByScreen(10),     switchByScreen(10000),   switchBesidePopups(8),
            switchBesidePopups(64), switchBesidePopups(512), switchWithKeys(20),
            switchWithKeys(100),    ignoredEvent(),          layeredSwitch(2),
            layeredSwitch(3),       layeredSwitch(4),        forwardAndBack()};
}
