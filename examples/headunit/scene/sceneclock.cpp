#include "sceneclock.h"

namespace headunit {

SceneClock::SceneClock(QObject *parent) : QAnimationDriver(parent)
{
    install();
}

SceneClock::~SceneClock()
{
    uninstall();
}

void SceneClock::tick()
{
    m_elapsed += frameMs();
    advance();
}

int SceneClock::frameMs()
{
    return 16; // sixty frames a second
}

qint64 SceneClock::elapsed() const
{
    return m_elapsed;
}

// Animations ask for the time since the driver was started.
void SceneClock::start()
{
    m_elapsed = 0;
    QAnimationDriver::start();
}

} // namespace headunit
