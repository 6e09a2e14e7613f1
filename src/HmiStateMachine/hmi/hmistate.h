#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/namedstate.h>

namespace HmiStateMachine {

/**
 * Base of the states of a screen flow.
 *
 * Each entry writes a marker for measuring screen changes and tells the view layer whether popups
 * are on. The popup behaviour is inherited: a state starts with that of its parent and follows it
 * until it is given another one of its own.
 */
class HMISTATEMACHINE_EXPORT HmiState : public NamedState
{
    Q_OBJECT

public:
    /** Any other value is kept and inherited, and announces nothing on entry. */
    enum PopupBehavior : int {
        DefaultPopupBehavior = 0, ///< entry resets the view layer's popup behaviour
        PopupBehaviorOff = 1, ///< entry switches popups off
        PopupBehaviorOn = 2 ///< entry switches popups on
    };

    /** Lands in the exclusive layer of a @p parent that has layers. */
    explicit HmiState(const QString &name, QState *parent = nullptr);

    /** Stays a child of @p parent itself, also when that has layers. */
    explicit HmiState(QState *parent = nullptr);
    ~HmiState() override;

    /**
     * A state that carries @p name without entering it into the registry, so that many states may
     * have it. Owned by @p parent, or by the caller when that is null.
     */
    static HmiState *createWithoutHashing(const QString &name, QState *parent);

    /** What an entry tells the view layer; DefaultPopupBehavior unless inherited or set. */
    PopupBehavior popupBehavior() const;

    /**
     * Adds @p t, as NamedState::addTransition() does, and lets a signal transition know its new
     * source.
     */
    void addHmiTransition(QAbstractTransition *t);

public Q_SLOTS:
    /**
     * Gives the state a behaviour of its own. A change cuts the inheritance from the parent for
     * good; the value it has already changes nothing.
     */
    void setPopupBehavior(PopupBehavior behavior);

    /** Takes over the behaviour of the parent. */
    void syncPopupBehavior(PopupBehavior behavior);

Q_SIGNALS:
    /** Only on a real change, after the value is stored. */
    void popupBehaviorChanged(PopupBehavior arg);

protected:
    /**
     * Writes the marker, does what NamedState does, and tells the view layer the popup behaviour.
     */
    void onEntry(QEvent *event) override;

    /** As NamedState does. */
    void onExit(QEvent *event) override;

public:
    /** The initial state, for states that run more than one layer. */
    virtual void setInitialHmiState(QState *state);

    /** Null when there is none. */
    virtual QAbstractState *initialHmiState() const;

private:
    Q_DISABLE_COPY(HmiState)

    void inheritPopupBehavior(QState *parent);

    PopupBehavior m_popupBehavior = DefaultPopupBehavior;
};

} // namespace HmiStateMachine
