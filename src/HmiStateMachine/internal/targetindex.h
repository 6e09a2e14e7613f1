#pragma once

#include <HmiStateMachine/named/namedstate.h>

#include <QHash>
#include <QString>

namespace HmiStateMachine {

/**
 * The registered states of one class by an id of theirs that is not their name. Of several with the
 * same id it knows the one that comes first in the registry.
 *
 * It is made anew at the first search after a name has been registered or given up, by whatever
 * state, or after invalidate(): a flow that stands is searched in the same time however large it
 * is. Searches belong to the thread of the machine.
 */
template <typename State> class TargetIndex
{
public:
    using Id = QString (State::*)() const;

    explicit TargetIndex(Id id) : m_id(id) { }

    /**
     * To be called at the end of the class's constructor and whenever the id of a state has
     * changed, from any thread. A state is registered before its class can be told: an index that
     * is made between the two misses it.
     */
    static void invalidate() { NamedState::noteRegistryChange(); }

    State *find(const QString &id)
    {
        // Read before the registry is walked: a change meanwhile makes the index old already.
        const int changes = NamedState::registryChanges();
        if (changes != m_changes) {
            m_changes = changes;
            build();
        }
        return m_states.value(id, nullptr);
    }

private:
    void build()
    {
        m_states.clear();
        const auto states = NamedState::namedStates();
        for (NamedState *named : states) {
            auto *state = qobject_cast<State *>(named);
            if (state && !m_states.contains((state->*m_id)())) {
                m_states.insert((state->*m_id)(), state);
            }
        }
    }

    Id m_id;
    QHash<QString, State *> m_states;
    int m_changes = 0; // none yet, as long as there has been no state
};

} // namespace HmiStateMachine
