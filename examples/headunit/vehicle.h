#pragma once

#include <QObject>
#include <QString>
#include <QVariant>

namespace headunit {

/** Up to this speed, in kilometres per hour, the driver may watch and type. */
constexpr int walkingPace = 5;

/** The simulated vehicle: properties that tell of their changes, as a real one's interface would.
 */
class Vehicle : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool ready READ ready WRITE setReady NOTIFY readyChanged)
    Q_PROPERTY(int speed READ speed WRITE setSpeed NOTIFY speedChanged)
    Q_PROPERTY(bool moving READ isMoving NOTIFY movingChanged)
    Q_PROPERTY(QString gear READ gear WRITE setGear NOTIFY gearChanged)
    Q_PROPERTY(int fuel READ fuel WRITE setFuel NOTIFY fuelChanged)
    Q_PROPERTY(bool phoneConnected READ phoneConnected WRITE setPhoneConnected NOTIFY
                   phoneConnectedChanged)

public:
    explicit Vehicle(QObject *parent = nullptr);
    ~Vehicle() override;

    bool ready() const;
    void setReady(bool ready);

    /** Kilometres per hour. */
    int speed() const;
    void setSpeed(int speed);

    /** Faster than the driver may watch and type; follows the speed. */
    bool isMoving() const;

    /** "P", "R", "N" or "D". */
    QString gear() const;
    void setGear(const QString &gear);
    bool isReversing() const;

    /** Percent of the tank. */
    int fuel() const;
    void setFuel(int fuel);

    bool phoneConnected() const;
    void setPhoneConnected(bool connected);

    /** Nobody has chosen a language yet. */
    bool isFirstStart() const;
    void setFirstStart(bool first);

    /** The properties that a scenario can set: all but those that follow others. */
    static QStringList propertyNames();

    /** The values that @p property takes, in words: "a whole number from 0 to 300". */
    static QString valuesOf(const QString &property);
    static bool accepts(const QString &property, const QVariant &value);

Q_SIGNALS:
    void readyChanged(bool ready);

    /** The systems have come up; follows readyChanged(). */
    void systemReady();
    void speedChanged(int speed);
    void movingChanged(bool moving);
    void gearChanged(const QString &gear);
    void fuelChanged(int fuel);
    void phoneConnectedChanged(bool connected);

private:
    Q_DISABLE_COPY(Vehicle)

    bool m_firstStart = false;
    bool m_ready = false;
    int m_speed = 0;
    QString m_gear = QStringLiteral("P");
    int m_fuel = 80;
    bool m_phoneConnected = false;
};

} // namespace headunit
