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
 *
 * It makes and owns both layers, which are entered and left with it. Leaving it hides its popups,
 * and none of them returns.
 *
 * @code
 * auto *screens = new HmiLayeredState("Screens", machine);
 * screens->setInitialHmiState(new HmiViewState("Home", screens));
 * new PopupState("phone/call", screens, 1);    // 1: a kind that the view layer knows
 * @endcode
 */
class HMISTATEMACHINE_EXPORT HmiLayeredState : public HmiState
{
    Q_OBJECT

public:
    /** The root of the popup layer is named @p name followed by "_PopupRootState". */
    explicit HmiLayeredState(const QString &name, QState *parent = nullptr);
    ~HmiLayeredState() override;

    /** The parent of the screens. It carries the name "Exclusive" without being registered. */
    HmiState *exclusiveState() const;

    /** The root of the popup layer. */
    PopupRootState *popupState() const;

    /** Warns and forwards to setInitialHmiState(). */
    void setInitialState(QState *state) override;

    /** Warns and forwards to initialHmiState(). */
    QState *initialState() const override;

    /** The initial state of the exclusive layer. A popup is refused with a warning. */
    void setInitialHmiState(QState *state) override;

    /** The initial state of the exclusive layer; null when there is none. */
    QAbstractState *initialHmiState() const override;

private:
    Q_DISABLE_COPY(HmiLayeredState)

    HmiState *m_exclusiveState = nullptr;
    PopupRootState *m_popupState = nullptr;
};

} // namespace HmiStateMachine
