// The keys beside the screen. They tell that they were pressed; what follows is the flow's matter.
#pragma once

#include <QObject>

class HardKeys : public QObject
{
    Q_OBJECT

public:
    enum Key { Home = 1, Louder = 2 };
    enum Status { Released = 0, Pressed = 1 };

    void press(int key)
    {
        Q_EMIT changed(key, Pressed);
        Q_EMIT changed(key, Released);
    }

Q_SIGNALS:
    void changed(int key, int status);
};
