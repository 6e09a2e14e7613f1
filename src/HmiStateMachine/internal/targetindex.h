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
 * is. For the thread of the machine.
 */
template <typename State> class TargetIndex
{
public:
    using Id = QString (State::*)() const;

    /** Does not hold for states whose @p id changes, unless invalidate() is called each time. */
    explicit TargetIndex(Id id) : m_id(id) { }

    State *find(const QString &id)
    {
        // Read before the registry is walked: a change meanwhile makes the index old already.
        const int changes = NamedState::registryChanges();
        if (!m_valid || changes != m_changes) {
            m_changes = changes;
            build();
        }
        return m_states.value(id, nullptr);
    }

    void invalidate() { m_valid = false; }

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
        m_valid = true;
    }

    Id m_id;
    QHash<QString, State *> m_states;
    int m_changes = 0;
    bool m_valid = false;
};

} // namespace HmiStateMachine
