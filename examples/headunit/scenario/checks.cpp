#include "checks.h"

#include "arguments.h"
#include "flow/building.h"
#include "transcript.h"
#include "viewlayer.h"
#include "vocabulary.h"

#include <HmiStateMachine/hmi/hmibacktransition.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/popup/popupstate.h>

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

// The view layer goes by view ids, a scenario by the names of the popups.
QString popupOfId(const QString &id)
{
    const PopupState *popup = PopupState::stateForTarget(id);
    return popup ? popup->name() : nowhere;
}

QString popupsOfIds(const QStringList &ids)
{
    QStringList names;
    for (const QString &id : ids) {
        names.append(popupOfId(id));
    }
    return names.isEmpty() ? nowhere : names.join(' ');
}

Action expectPopup(Arguments &arguments)
{
    const QString name = arguments.name("the name of a popup or none", popupNames() << nowhere);
    return [name](Stage &stage) {
        return compare("the popup in front to be", name,
                       popupOfId(stage.viewLayer->popupInFront()));
    };
}

Action expectStacked(Arguments &arguments)
{
    const QStringList names =
        arguments.names("the names of popups or none", popupNames() << nowhere);
    if (names.contains(nowhere) && names.size() > 1) {
        arguments.fail({"none alone or the names of popups", quoted(names.join(' ')), QString()});
    }
    return [names](Stage &stage) {
        return compare("the stacked popups to be", names.join(' '),
                       popupsOfIds(stage.viewLayer->stackedPopups()), "the oldest comes first");
    };
}

Action expectBlocked(Arguments &arguments)
{
    const QString name = arguments.name("the name of a popup", popupNames());
    return [name](Stage &stage) {
        const bool refused = stage.viewLayer->wasRefused(popup(name)->popupViewId());
        return compare("popup " + name + " to be", "blocked", refused ? "blocked" : "not blocked",
                       "blocked is what was refused and not shown since");
    };
}

} // namespace

Action parseExpect(Arguments &arguments)
{
    const QString kind =
        arguments.name("something to expect",
                       {"view", "back", "entered", "left", "calls", "popup", "stacked", "blocked"});
    if (kind == "view") {
        return expectView(arguments);
    }
    if (kind == "back") {
        return expectBack(arguments);
    }
    if (kind == "calls") {
        return expectCalls(arguments);
    }
    if (kind == "popup") {
        return expectPopup(arguments);
    }
    if (kind == "stacked") {
        return expectStacked(arguments);
    }
    if (kind == "blocked") {
        return expectBlocked(arguments);
    }
    return expectActive(kind == "entered", arguments);
}

} // namespace headunit
