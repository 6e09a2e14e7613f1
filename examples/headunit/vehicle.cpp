#include "vehicle.h"

#include <QMetaProperty>
#include <QStringList>

#include <cmath>

namespace headunit {

namespace {

constexpr int maximumSpeed = 300;
constexpr int fullTank = 100;

const QStringList &gears()
{
    static const QStringList list{"P", "R", "N", "D"};
    return list;
}

int maximumOf(const QString &property)
{
    return property == "speed" ? maximumSpeed : fullTank;
}

QVariant::Type typeOf(const QString &property)
{
    const QMetaObject &meta = Vehicle::staticMetaObject;
    return meta.property(meta.indexOfProperty(qPrintable(property))).type();
}

// Numbers from a scenario may be stored as doubles.
bool isWholeNumber(const QVariant &value, int maximum)
{
    bool isNumber = value.type() != QVariant::String && value.type() != QVariant::Bool;
    const double number = isNumber ? value.toDouble(&isNumber) : 0;
    return isNumber && number >= 0 && number <= maximum && std::floor(number) == number;
}

} // namespace

Vehicle::Vehicle(QObject *parent) : QObject(parent)
{
}

Vehicle::~Vehicle() = default;

bool Vehicle::ready() const
{
    return m_ready;
}

void Vehicle::setReady(bool ready)
{
    if (ready == m_ready) {
        return;
    }
    m_ready = ready;
    Q_EMIT readyChanged(ready);
    if (ready) {
        Q_EMIT systemReady();
    }
}

int Vehicle::speed() const
{
    return m_speed;
}

void Vehicle::setSpeed(int speed)
{
    if (speed == m_speed) {
        return;
    }
    const bool wasMoving = isMoving();
    m_speed = speed;
    Q_EMIT speedChanged(speed);
    if (isMoving() != wasMoving) {
        Q_EMIT movingChanged(isMoving());
    }
}

bool Vehicle::isMoving() const
{
    return m_speed > walkingPace;
}

QString Vehicle::gear() const
{
    return m_gear;
}

void Vehicle::setGear(const QString &gear)
{
    if (gear == m_gear) {
        return;
    }
    m_gear = gear;
    Q_EMIT gearChanged(gear);
}

bool Vehicle::isReversing() const
{
    return m_gear == "R";
}

int Vehicle::fuel() const
{
    return m_fuel;
}

void Vehicle::setFuel(int fuel)
{
    if (fuel == m_fuel) {
        return;
    }
    m_fuel = fuel;
    Q_EMIT fuelChanged(fuel);
}

bool Vehicle::phoneConnected() const
{
    return m_phoneConnected;
}

void Vehicle::setPhoneConnected(bool connected)
{
    if (connected == m_phoneConnected) {
        return;
    }
    m_phoneConnected = connected;
    Q_EMIT phoneConnectedChanged(connected);
}

bool Vehicle::isFirstStart() const
{
    return m_firstStart;
}

void Vehicle::setFirstStart(bool first)
{
    m_firstStart = first;
}

QStringList Vehicle::propertyNames()
{
    QStringList names;
    const QMetaObject &meta = staticMetaObject;
    for (int i = meta.propertyOffset(); i < meta.propertyCount(); ++i) {
        if (meta.property(i).isWritable()) {
            names.append(QString::fromLatin1(meta.property(i).name()));
        }
    }
    return names;
}

QString Vehicle::valuesOf(const QString &property)
{
    switch (typeOf(property)) {
    case QVariant::Bool:
        return "true or false";
    case QVariant::Int:
        return QString("a whole number from 0 to %1").arg(maximumOf(property));
    default:
        return "one of \"" + gears().join("\", \"") + '"';
    }
}

bool Vehicle::accepts(const QString &property, const QVariant &value)
{
    switch (typeOf(property)) {
    case QVariant::Bool:
        return value.type() == QVariant::Bool;
    case QVariant::Int:
        return isWholeNumber(value, maximumOf(property));
    default:
        return value.type() == QVariant::String && gears().contains(value.toString());
    }
}

} // namespace headunit
