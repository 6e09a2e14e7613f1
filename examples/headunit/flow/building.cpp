#include "building.h"

#include "viewlayer.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popupstate.h>

using namespace HmiStateMachine;

namespace headunit {

NamedState *state(const QString &name)
{
    NamedState *result = NamedState::stateForName(name);
    if (!result) {
        qFatal("The flow has no state named %s", qPrintable(name));
    }
    return result;
}

HmiViewState *view(const QString &name)
{
    auto *result = qobject_cast<HmiViewState *>(state(name));
    if (!result) {
        qFatal("The state named %s is no view", qPrintable(name));
    }
    return result;
}

HmiViewState *addView(const QString &name, QState *domain)
{
    HmiViewState *result = addViewWithoutBack(name, domain);
    result->setHandlesBackEvent(true);
    return result;
}

HmiViewState *addViewWithoutBack(const QString &name, QState *domain)
{
    return new HmiViewState(name, domain);
}

HmiTransition *onEvent(const QString &event, QState *source, const QString &target)
{
    HmiTransition *transition = onEvent(event, source);
    transition->setTargetState(state(target));
    return transition;
}

HmiTransition *onEvent(const QString &event, QState *source)
{
    return new HmiTransition(event, source);
}

// The state of all screens is layered, and a transition of it belongs to its exclusive layer. An
// external one from there would leave and enter the layer too.
void leadTo(const QString &target, QAbstractTransition *transition)
{
    transition->setTransitionType(QAbstractTransition::InternalTransition);
    transition->setTargetState(state(target));
}

void tellEntry(const QString &name, ViewLayer *viewLayer)
{
    QObject::connect(state(name), &QAbstractState::entered, viewLayer,
                     [name, viewLayer] { viewLayer->showStatus("now " + name); });
}

HmiLayeredState *layer(const QString &name)
{
    auto *result = qobject_cast<HmiLayeredState *>(state(name));
    if (!result) {
        qFatal("The state named %s is not layered", qPrintable(name));
    }
    return result;
}

PopupState *popup(const QString &name)
{
    auto *result = qobject_cast<PopupState *>(state(name));
    if (!result) {
        qFatal("The state named %s is no popup", qPrintable(name));
    }
    return result;
}

void requestView(const QString &name)
{
    StateMachine::instance()->postEvent(new HmiViewEvent(name, QVariant()));
}

void requestBack(unsigned char depth, const QString &target)
{
    StateMachine::instance()->postEvent(new HmiBackEvent(depth, target));
}

void requestPopup(const QString &name)
{
    StateMachine::instance()->postEvent(new PopupEvent(name, QVariant()));
}

void dismissPopup(const QString &name)
{
    StateMachine::instance()->postEvent(
        new PopupEvent(name + PopupDismissTransition::dismissEventSigniture, QVariant()));
}

void raiseEvent(const QString &name)
{
    StateMachine::instance()->postEvent(new HmiEvent(name, QVariant()));
}

} // namespace headunit
