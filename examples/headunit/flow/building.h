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

/** What the flow listens to and tells things to; all of it outlives the flow's use. */
struct Surroundings
{
    Vehicle *vehicle;
    HardKeys *keys;
    ViewLayer *viewLayer;
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
