#pragma once

#include <QObject>
#include <QStringList>

namespace HmiStateMachine {
class Requests;
} // namespace HmiStateMachine

namespace headunit {

/** The keys beside the screen. They only tell that they were pressed; the flow decides. */
class HardKeys : public QObject
{
    Q_OBJECT

public:
    enum Key { Home = 1, Back = 2, Phone = 3, Volume = 4 };
    Q_ENUM(Key)

    enum Status { Released = 0, Pressed = 1, Held = 2 };

    explicit HardKeys(QObject *parent = nullptr);
    ~HardKeys() override;

    /** What key transitions watch. */
    static const char *signal();

    static QStringList names();

    /** The key of that name; -1 when there is none. */
    static int fromName(const QString &name);

Q_SIGNALS:
    void keyChanged(int key, int status);

private:
    Q_DISABLE_COPY(HardKeys)
};

/** Lets the keys that a scene asks for by name be pressed. */
void connectKeys(HmiStateMachine::Requests *requests, HardKeys *keys);

} // namespace headunit
