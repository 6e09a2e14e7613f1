#include "regions.h"

#include "driving.h"

#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>

using namespace HmiStateMachine;

Regions::Regions(const QStringList &names)
    : m_names(names), m_root(new NamedState("Regions", QState::ParallelStates, &m_machine))
{
    for (const QString &name : names) {
        auto *region = new NamedState(name, m_root);
        auto *home = new NamedState(name + "Home", region);
        auto *away = new NamedState(name + "Away", region);
        region->QState::setInitialState(home);
        (new HmiTransition("leave " + name, home))->setTargetState(away);
        (new HmiTransition("come back " + name, away))->setTargetState(home);
    }
}

NamedState *Regions::home(const QString &region) const
{
    return find(region + "Home");
}

NamedState *Regions::away(const QString &region) const
{
    return find(region + "Away");
}

void Regions::beginAway(const QString &region)
{
    find(region)->QState::setInitialState(away(region));
}

void Regions::start()
{
    startIn(m_machine, m_root);
}

void Regions::leave(const QString &region)
{
    post("leave " + region);
}

void Regions::comeBack(const QString &region)
{
    post("come back " + region);
}

void Regions::post(QEvent *event)
{
    m_machine.postEvent(event);
    settle();
}

void Regions::post(const QString &eventName)
{
    post(new HmiEvent(eventName, QVariant()));
}

QStringList Regions::active() const
{
    QStringList result;
    const auto configuration = m_machine.configuration();
    for (const QString &name : m_names) {
        for (NamedState *state : {home(name), away(name)}) {
            if (configuration.contains(state)) {
                result.append(state->name());
            }
        }
    }
    return result;
}

NamedState *Regions::find(const QString &name) const
{
    return m_root->findChild<NamedState *>(name);
}
