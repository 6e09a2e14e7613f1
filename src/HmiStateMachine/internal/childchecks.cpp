#include <HmiStateMachine/internal/childchecks.h>

#include <HmiStateMachine/named/namedstate.h>

#include <QThreadStorage>

namespace HmiStateMachine {

ChildChecks &ChildChecks::ofThisThread()
{
    // Not thread_local: such an object lives on for a while when QThread::wait() has returned, and
    // whoever waited may destroy the thread's states.
    static QThreadStorage<ChildChecks *> storage;
    ChildChecks *&checks = storage.localData();
    if (!checks) {
        checks = new ChildChecks;
    }
    return *checks;
}

ChildChecks::ChildChecks() = default;

ChildChecks::~ChildChecks()
{
    for (NamedState *state : qAsConst(m_states)) {
        if (state) {
            state->m_childCheckPlace = NamedState::noPlace;
        }
    }
}

void ChildChecks::add(NamedState *state)
{
    if (!m_posted) {
        m_posted = true;
        QMetaObject::invokeMethod(
            this, [this] { run(); }, Qt::QueuedConnection);
    }
    state->m_childCheckPlace = m_states.size();
    m_states.append(state);
}

void ChildChecks::remove(NamedState *state)
{
    const int place = state->m_childCheckPlace;
    if (m_states.value(place) == state) {
        m_states[place] = nullptr;
    }
    // States that come and go before the event loop runs must not leave a place each.
    while (!m_states.isEmpty() && !m_states.last()) {
        m_states.removeLast();
    }
    state->m_childCheckPlace = NamedState::noPlace;
}

void ChildChecks::run()
{
    m_posted = false;
    QVector<NamedState *> states;
    states.swap(m_states);
    for (NamedState *state : qAsConst(states)) {
        if (state) {
            state->m_childCheckPlace = NamedState::noPlace;
            state->checkChildren();
        }
    }
}

} // namespace HmiStateMachine
