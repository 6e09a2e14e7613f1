#include "services.h"

#include "flow/building.h"
#include "vehicle.h"

#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QTimer>
#include <QVariantMap>

using namespace HmiStateMachine;

namespace headunit {

namespace {

constexpr int systemsMs = 1500;
constexpr int phoneMs = 4000;

} // namespace

Services::Services(Vehicle *vehicle, QObject *parent) : QObject(parent), m_vehicle(vehicle)
{
    answer("Media/Connecting", 1200, "SourceReady");
    answer("Navigation/Overview", 900, "RouteReady",
           QVariantMap{{"eta", 34}, {"via", "Ring Road"}});
    answer("Audio/Announcement", 6000, "AnnouncementDone");
    answer("Settings/Update", 12000, "UpdateDone");
}

Services::~Services() = default;

void Services::start()
{
    QTimer::singleShot(systemsMs, m_vehicle, [this] { m_vehicle->setReady(true); });
    QTimer::singleShot(phoneMs, m_vehicle, [this] { m_vehicle->setPhoneConnected(true); });
}

void Services::answer(const char *name, int milliseconds, const QString &event,
                      const QVariant &data)
{
    auto *timer = new QTimer(this);
    timer->setSingleShot(true);
    timer->setInterval(milliseconds);
    connect(timer, &QTimer::timeout, this,
            [event, data] { StateMachine::instance()->postEvent(new HmiEvent(event, data)); });
    connect(state(name), &QAbstractState::entered, timer, qOverload<>(&QTimer::start));
    connect(state(name), &QAbstractState::exited, timer, &QTimer::stop);
}

} // namespace headunit
