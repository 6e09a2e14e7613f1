#pragma once

#include <HmiStateMachine/hmi/hmistate.h>
#include <HmiStateMachine/hmistatemachine_export.h>

namespace HmiStateMachine {

class PopupRootState;

/**
 * A state that runs an exclusive layer of screens and a layer of popups beside each other.
 *
 * States that are made with it as their parent land in the exclusive layer, of which exactly one is
 * active; the initial one is set by setInitialHmiState(). Popups are made with it, too, and
 * requested by PopupEvents.
 */
class HMISTATEMACHINE_EXPORT HmiLayeredState : public HmiState
{
    Q_OBJECT

public:
    explicit HmiLayeredState(const QString &name, QState *parent = nullptr);
    ~HmiLayeredState() override;

    HmiState *exclusiveState() const;
    PopupRootState *popupState() const;

    /** Warns and forwards to setInitialHmiState(). */
    void setInitialState(QState *state) override;

    /** Warns and forwards to initialHmiState(). */
    QState *initialState() const override;

    /** The initial state of the exclusive layer. A popup is refused with a warning. */
    void setInitialHmiState(QState *state) override;
    QAbstractState *initialHmiState() const override;

private:
    Q_DISABLE_COPY(HmiLayeredState)

    HmiState *m_exclusiveState = nullptr;
    PopupRootState *m_popupState = nullptr;
};

} // namespace HmiStateMachine
