#pragma once

#include <QObject>

/** Keys as they reach the application: one signal with the key and whether it is down. */
class KeySource : public QObject
{
    Q_OBJECT

Q_SIGNALS:
    void keyChanged(int key, int status);
};

constexpr int keyPressed = 1;
