#include "voice.h"

#include "building.h"
#include "guards.h"
#include "parts.h"
#include "vehicle.h"

#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/namedstate.h>

#include <QVariantMap>

using namespace HmiStateMachine;

namespace headunit {

namespace {

struct Phrase
{
    const char *name;
    const char *target;
};

// These lead from any screen to another one.
const Phrase viewPhrases[] = {
    {"home", "Home/Main"},
    {"call", "Phone/Contacts"},
    {"navigate", "Navigation/Destination"},
    {"play", "Media/Player"},
};

// This one is heard and not seen.
const Phrase mutePhrase = {"mute", "Audio/Muted"};

// The mark says that the transition was asked for by voice; when it fires, the library hands the
// request to the view layer. The guard is the moment at which what was said is known.
void markAsVoiceRequest(const QString &phrase, HmiTransition *transition)
{
    QObject::connect(transition, &GuardedTransition::transitionTest, transition,
                     [phrase, transition] {
                         QVariantMap request{{"phrase", phrase}};
                         request.insert("said", transition->transitionData());
                         transition->setIsVREventTransition(true, request);
                     });
}

HmiTransition *onPhrase(const Phrase &phrase, QState *source)
{
    HmiTransition *transition = onEvent(voiceEvent(phrase.name), source);
    markAsVoiceRequest(phrase.name, transition);
    return transition;
}

} // namespace

QStringList voicePhrases()
{
    QStringList phrases;
    for (const Phrase &phrase : viewPhrases) {
        phrases.append(phrase.name);
    }
    return phrases << mutePhrase.name;
}

QString voiceEvent(const QString &phrase)
{
    return "Voice/" + phrase;
}

void addVoiceTransitions(const Surroundings &surroundings)
{
    for (const Phrase &phrase : viewPhrases) {
        HmiTransition *transition = onPhrase(phrase, state("Screens"));
        leadTo(phrase.target, transition);
        refuseWhileActive(state(phrase.target), transition);
        refuseInReverse(surroundings.vehicle, transition);
    }
    HmiTransition *mute = onPhrase(mutePhrase, state("Audio/Playing"));
    mute->setTargetState(state(mutePhrase.target));
}

} // namespace headunit
