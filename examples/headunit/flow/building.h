#pragma once

#include <QString>
#include <QVariant>

class QAbstractTransition;
class QObject;
class QState;

namespace HmiStateMachine {
class HmiLayeredState;
class HmiTransition;
class HmiViewState;
class NamedState;
class PopupState;
} // namespace HmiStateMachine

/** The few phrases in which the flow is written. */
namespace headunit {

class HardKeys;
class Vehicle;
class ViewLayer;

/** How long things take in the flow, in milliseconds. */
struct Timing
{
    int welcome; ///< how long the welcome screen can be seen at least
    int connecting; ///< after which a source that does not connect is given up
    int note; ///< after which a note goes by itself
    int volume; ///< the same for the volume
    int volumeTick; ///< how often the volume tells what is left of its time
};

/** For scenarios: long enough to be told apart, short enough not to be waited for. */
constexpr Timing scenarioTiming{150, 120, 100, 200, 50};

/** For a person, who wants to read. */
constexpr Timing personTiming{1800, 4000, 4000, 3000, 100};

/** What the flow listens to and tells things to; all of it outlives the flow's use. */
struct Surroundings
{
    Vehicle *vehicle;
    HardKeys *keys;
    ViewLayer *viewLayer;
    Timing timing;
};

/** The state of that name; a name that no state has is an error of the flow and ends the demo. */
HmiStateMachine::NamedState *state(const QString &name);
HmiStateMachine::HmiViewState *view(const QString &name);
HmiStateMachine::HmiLayeredState *layer(const QString &name);
HmiStateMachine::PopupState *popup(const QString &name);

/** A view that leads back to wherever it was opened from. */
HmiStateMachine::HmiViewState *addView(const QString &name, QState *domain);

/** A view that leads back to nowhere until it is told otherwise. */
HmiStateMachine::HmiViewState *addViewWithoutBack(const QString &name, QState *domain);

/** Lets the event lead from @p source to the state named @p target, whatever data it carries. */
HmiStateMachine::HmiTransition *onEvent(const QString &event, QState *source,
                                        const QString &target);

/** An event that is taken without leaving the state; connect to triggered(). */
HmiStateMachine::HmiTransition *onEvent(const QString &event, QState *source);

/** Lets @p transition, from the state of all screens, lead to one of them; see the source. */
void leadTo(const QString &target, QAbstractTransition *transition);

/** Lets the user know whenever the state named @p name is entered. */
void tellEntry(const QString &name, ViewLayer *viewLayer);

/** What a request by the application itself is posted as. */
void requestView(const QString &name);
void requestBack(unsigned char depth, const QString &target = QString());
void requestPopup(const QString &name);
void dismissPopup(const QString &name);
void raiseEvent(const QString &name);

} // namespace headunit
