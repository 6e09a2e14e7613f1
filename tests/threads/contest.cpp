#include "contest.h"

#include <QtGlobal>

using namespace HmiStateMachine;

namespace {

constexpr int defaultMs = 1000;

std::atomic<int> s_collisions{0};

void countCollisions(QtMsgType, const QMessageLogContext &context, const QString &)
{
    if (qstrcmp(context.function, "hash") == 0) {
        s_collisions.fetch_add(1, std::memory_order_relaxed);
    }
}

std::chrono::milliseconds duration()
{
    const int chosen = qEnvironmentVariableIntValue("HMI_THREADS_MS");
    return std::chrono::milliseconds(chosen > 0 ? chosen : defaultMs);
}

} // namespace

Contest::Contest() : m_end(std::chrono::steady_clock::now() + duration()), m_holders(names)
{
}

bool Contest::isOver() const
{
    return std::chrono::steady_clock::now() >= m_end;
}

QString Contest::name(int number)
{
    return QStringLiteral("Contested %1").arg(number);
}

void Contest::noteWon(int number, NamedState *state)
{
    add(m_wins);
    if (m_holders.at(number).exchange(state, std::memory_order_relaxed)) {
        noteFault();
    }
}

void Contest::noteGivenUp(int number, NamedState *state)
{
    if (m_holders.at(number).exchange(nullptr, std::memory_order_relaxed) != state) {
        noteFault();
    }
}

CollisionCounter::CollisionCounter() : m_previous(qInstallMessageHandler(countCollisions))
{
    s_collisions = 0;
}

CollisionCounter::~CollisionCounter()
{
    qInstallMessageHandler(m_previous);
}

int CollisionCounter::collisions()
{
    return s_collisions;
}
