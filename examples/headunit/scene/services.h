#pragma once

#include <QObject>
#include <QVariant>

namespace headunit {

class Vehicle;

/**
 * The rest of the car, for a person at the keyboard: systems come up, a source connects, a route is
 * found, an update ends. In a scenario the scenario says when. Made once the flow is built.
 */
class Services : public QObject
{
    Q_OBJECT

public:
    explicit Services(Vehicle *vehicle, QObject *parent = nullptr);
    ~Services() override;

    /** The systems come up. */
    void start();

private:
    Q_DISABLE_COPY(Services)

    /** Raises @p event when the state named @p state has been active for so long. */
    void answer(const char *state, int milliseconds, const QString &event,
                const QVariant &data = QVariant());

    Vehicle *m_vehicle;
};

} // namespace headunit
