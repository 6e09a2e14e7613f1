#include "checks.h"

#include "arguments.h"
#include "flow/building.h"
#include "transcript.h"
#include "viewlayer.h"
#include "vocabulary.h"

#include <HmiStateMachine/hmi/hmibacktransition.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

constexpr int maximumCalls = 100000;
const QString nowhere = QStringLiteral("none");

std::optional<Fault> compare(const QString &what, const QString &expected, const QString &found,
                             const QString &remedy = QString())
{
    if (expected == found) {
        return std::nullopt;
    }
    return Fault{what + ' ' + expected, found, remedy};
}

// Whichever kind of back transition the view has: there is never more than one.
QString backTargetOfActiveView()
{
    const HmiViewState *active = HmiViewState::activeViewState();
    const auto *transition = active
        ? active->findChild<HmiBackTransition *>(QString(), Qt::FindDirectChildrenOnly)
        : nullptr;
    const QString name = transition ? transition->targetName() : QString();
    return name.isEmpty() ? nowhere : name;
}

Action expectView(Arguments &arguments)
{
    const QString id = arguments.name("the id of a view", viewIds());
    return [id](Stage &stage) { return compare("the view", id, stage.viewLayer->activeView()); };
}

Action expectBack(Arguments &arguments)
{
    const QString name = arguments.name("the name of a view or none", viewStateNames() << nowhere);
    return [name](Stage &) { return compare("back to lead to", name, backTargetOfActiveView()); };
}

Action expectActive(bool wanted, Arguments &arguments)
{
    const QString name = arguments.name("the name of a state", stateNames());
    return [name, wanted](Stage &) {
        const bool active = state(name)->isActive();
        return compare("state " + name + " to be", wanted ? "active" : "inactive",
                       active ? "active" : "inactive");
    };
}

Action expectCalls(Arguments &arguments)
{
    const int calls = arguments.number("a number of calls", 0, maximumCalls);
    return [calls](Stage &stage) {
        const int found = stage.transcript->calls();
        stage.transcript->resetCalls();
        return compare("the number of calls to be", QString::number(calls), QString::number(found),
                       "the transcript shows each call; counting begins after expect calls");
    };
}

} // namespace

Action parseExpect(Arguments &arguments)
{
    const QString kind =
        arguments.name("something to expect", {"view", "back", "entered", "left", "calls"});
    if (kind == "view") {
        return expectView(arguments);
    }
    if (kind == "back") {
        return expectBack(arguments);
    }
    if (kind == "calls") {
        return expectCalls(arguments);
    }
    return expectActive(kind == "entered", arguments);
}

} // namespace headunit
