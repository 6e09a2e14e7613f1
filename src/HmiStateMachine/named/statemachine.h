#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>

#include <QPointer>
#include <QStateMachine>

namespace HmiStateMachine {

class HmiState;

/**
 * The machine under which an application builds its tree of states.
 *
 * It publishes whether one designated state, the infotainment state, is active. Belongs to the
 * thread of the application object.
 */
class HMISTATEMACHINE_EXPORT StateMachine : public QStateMachine
{
    Q_OBJECT
    Q_PROPERTY(bool infotainmentStateActive READ infotainmentStateActive NOTIFY
                   infotainmentStateActiveChanged)

public:
    /** Makes a machine of its own, which instance() knows nothing of. */
    explicit StateMachine(QObject *parent = nullptr);
    ~StateMachine() override;

    /**
     * The machine of the process, to which the library itself posts; made by the first call as a
     * child of the application object, with which it goes. Call it from the thread of that object,
     * and not after that object is gone.
     */
    static StateMachine *instance();

    /**
     * Watches @p state, which must not be null, from its next entry or exit on; the flag is not
     * computed now. Not owned. An earlier state stays connected, but only the latest one decides.
     */
    void setInfotainmentState(HmiState *state);

    /** False until the infotainment state has been entered. */
    bool infotainmentStateActive() const;

Q_SIGNALS:
    /** Only on a real change, after the value is stored. */
    void infotainmentStateActiveChanged();

public Q_SLOTS:
    /** Computes the flag anew. */
    void updateActive();

private:
    Q_DISABLE_COPY(StateMachine)

    QPointer<HmiState> m_infotainmentState;
    bool m_infotainmentStateActive = false;
};

} // namespace HmiStateMachine
