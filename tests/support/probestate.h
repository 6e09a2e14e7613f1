#pragma once

#include "journal.h"

#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>

/** Writes to the journal how many transitions are just firing, from its own onEntry() and onExit().
 */
class ProbeState : public HmiStateMachine::NamedState
{
public:
    ProbeState(Journal &journal, const QString &name, QState *parent)
        : NamedState(name, parent), m_journal(journal)
    {
    }

protected:
    void onEntry(QEvent *event) override
    {
        write("entry");
        NamedState::onEntry(event);
    }

    void onExit(QEvent *event) override
    {
        write("exit");
        NamedState::onExit(event);
    }

private:
    void write(const QString &step)
    {
        const auto firing = HmiStateMachine::NamedTargetTransitionBase::triggeringTransition();
        m_journal.add(name() + ' ' + step + ", firing " + QString::number(firing.size()));
    }

    Journal &m_journal;
};
