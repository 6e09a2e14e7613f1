#pragma once

#include <QObject>

/** What the vehicle reports. */
class Vehicle : public QObject
{
    Q_OBJECT
    Q_PROPERTY(bool moving MEMBER m_moving NOTIFY movingChanged)
    Q_PROPERTY(bool phoneConnected MEMBER m_phoneConnected NOTIFY phoneConnectedChanged)

Q_SIGNALS:
    void movingChanged();
    void phoneConnectedChanged();
    void satellitesLost();

private:
    bool m_moving = false;
    bool m_phoneConnected = false;
};
