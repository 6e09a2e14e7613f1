#pragma once

#include <HmiStateMachine/named/namedstate.h>

#include <QHash>
#include <QString>

namespace HmiStateMachine {

/**
 * The registered states of one class by an id of theirs that is not their name. Of several with the
 * same id it knows the one that comes first in the registry.
 *
 * The first search after a name has been registered or given up, by whatever state, or after
 * invalidate() walks the registry; only the second one makes the index anew, which costs several
 * walks. So a flow that stands is searched in the same time however large it is, and one in which
 * states come and go between the searches is walked as if there were no index. Searches belong to
 * the thread of the machine.
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
            m_built = false;
            return walk(id);
        }
        if (!m_built) {
            build();
        }
        return m_states.value(id, nullptr);
    }

private:
    State *walk(const QString &id) const
    {
        const auto states = NamedState::namedStates();
        for (NamedState *named : states) {
            auto *state = qobject_cast<State *>(named);
            if (state && (state->*m_id)() == id) {
                return state;
            }
        }
        return nullptr;
    }

    void build()
    {
        m_states.clear();
        const auto states = NamedState::namedStates();
        for (NamedState *named : states) {
            if (auto *state = qobject_cast<State *>(named)) {
                State *&first = m_states[(state->*m_id)()];
                first = first ? first : state;
            }
        }
        m_built = true;
    }

    Id m_id;
    QHash<QString, State *> m_states;
    int m_changes = 0; // none yet, as long as there has been no state
    bool m_built = false;
};

} // namespace HmiStateMachine
