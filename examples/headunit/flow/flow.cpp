#include "flow.h"

#include "parts.h"
#include "popups.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/statemachine.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

struct Part
{
    const char *name;
    void (*addStates)(QState *, const Surroundings &);
    void (*addTransitions)(const Surroundings &);
};

// A fallback view looks up at once where it falls back to: the settings come before the phone.
const Part domains[] = {
    {"Home", addHomeViews, addHomeTransitions},
    {"Media", addMediaViews, addMediaTransitions},
    {"Settings", addSettingsViews, addSettingsTransitions},
    {"Phone", addPhoneViews, addPhoneTransitions},
    {"Navigation", addNavigationViews, addNavigationTransitions},
};

const Part regions[] = {
    {"Guidance", addGuidanceStates, addGuidanceTransitions},
    {"Audio", addAudioStates, addAudioTransitions},
};

// A domain is a plain named state: it announces no popup behaviour to the view layer.
void addPart(const Part &part, QState *parent, const Surroundings &surroundings)
{
    auto *region = new NamedState(part.name, parent);
    part.addStates(region, surroundings);
}

void addStates(QState *headUnit, const Surroundings &surroundings)
{
    auto *screens = new HmiLayeredState("Screens", headUnit);
    for (const Part &domain : domains) {
        addPart(domain, screens->exclusiveState(), surroundings);
    }
    screens->setInitialHmiState(state("Home"));
    new HmiLayeredState("Alerts", headUnit); // has no screens, but popups
    for (const Part &region : regions) {
        addPart(region, headUnit, surroundings);
    }
    new NamedState("Keys", headUnit);
}

// The keys come first: a state can block only such keys as are known by then.
void addTransitions(const Surroundings &surroundings)
{
    addKeyTransitions(surroundings);
    for (const Part &domain : domains) {
        domain.addTransitions(surroundings);
    }
    for (const Part &region : regions) {
        region.addTransitions(surroundings);
    }
    addVoiceTransitions(surroundings);
    addPopups(surroundings);
}

} // namespace

void buildFlow(const Surroundings &surroundings)
{
    StateMachine *machine = StateMachine::instance();
    auto *headUnit = new NamedState("HeadUnit", QState::ParallelStates, machine);
    addStates(headUnit, surroundings);
    addTransitions(surroundings);
    machine->setInitialState(headUnit);

    // As if home had just been left: the view that is opened first has somewhere to lead back to.
    HmiViewState::setLastKnownViewState("Home/Main");
}

} // namespace headunit
