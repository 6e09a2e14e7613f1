#include "viewflow.h"

#include "driving.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/simpleeventtransition.h>

using namespace HmiStateMachine;

HmiViewState *ViewFlow::view(const QString &name, QState *parent)
{
    auto *state = new HmiViewState(name, parent ? parent : &machine);
    record(state);
    return state;
}

HmiViewState *ViewFlow::backView(const QString &name, QState *parent)
{
    HmiViewState *state = view(name, parent);
    state->setHandlesBackEvent(true);
    return state;
}

HmiViewState *ViewFlow::viewOf(const QString &targetView, const QString &name)
{
    auto *state = new HmiViewState(targetView, name, &machine);
    state->setHandlesBackEvent(true);
    record(state);
    return state;
}

void ViewFlow::record(HmiViewState *view)
{
    QObject::connect(view, &HmiViewState::backStackPush, view, [this, view](const Identifier &id) {
        journal.add(view->name() + " backStackPush " + id);
    });
    QObject::connect(view, &HmiViewState::backStackPop, view,
                     [this, view] { journal.add(view->name() + " backStackPop"); });
}

void ViewFlow::start(QState *initial)
{
    while (initial->parentState() != &machine) {
        initial->parentState()->setInitialState(initial);
        initial = initial->parentState();
    }
    startIn(machine, initial);
    journal.clear();
}

void ViewFlow::request(const QString &viewId, const QVariant &data)
{
    post(new HmiViewEvent(viewId, data));
}

void ViewFlow::back(int depth, const QString &targetId)
{
    post(new HmiBackEvent(static_cast<unsigned char>(depth), targetId));
}

void ViewFlow::post(QEvent *event)
{
    machine.postEvent(event);
    settle();
}

QStringList ViewFlow::take()
{
    const QStringList lines = journal.lines();
    journal.clear();
    return lines;
}

QString ViewFlow::activeView()
{
    const HmiViewState *view = HmiViewState::activeViewState();
    return view ? view->name() : QString();
}

void lead(QEvent::Type type, QState *source, QAbstractState *goal)
{
    auto *transition = new SimpleEventTransition(type, source);
    transition->setTargetState(goal);
}

GuardedTransition *leadOnAtOnce(QState *source, QAbstractState *goal)
{
    auto *transition = new GuardedTransition(source);
    transition->setAllowTransitionDefault(true);
    transition->setTargetState(goal);
    return transition;
}
