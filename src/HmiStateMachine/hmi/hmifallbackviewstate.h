#pragma once

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/hmistatemachine_export.h>

namespace HmiStateMachine {

class HmiFallbackTransition;

/**
 * A view that may refuse to be shown: when permitted() is false on entry, or on reevaluate(), it
 * leads to its fallback state, and on entry the view layer never hears of it.
 *
 * The fallback event is posted to StateMachine::instance().
 */
class HMISTATEMACHINE_EXPORT HmiFallbackViewState : public HmiViewState
{
    Q_OBJECT

public:
    /** @p fallbackState is looked up by name now; make it first. */
    HmiFallbackViewState(const QString &name, const QString &fallbackState,
                         QState *parent = nullptr);

    /** With a target view that is not called like the state. */
    HmiFallbackViewState(const QString &targetView, const QString &name,
                         const QString &fallbackState, QState *parent = nullptr);
    ~HmiFallbackViewState() override;

    /**
     * Leads to the fallback state, whether or not the view is permitted. While
     * StateMachine::instance() does not run the event is lost, with a warning of Qt.
     */
    void postFallbackEvent();

public Q_SLOTS:
    /** Asks again; nothing while the view is not active. */
    void reevaluate();

protected:
    /** Asks permitted(): hands the view to the view layer, or posts the fallback event. */
    void onActivated() override;

public:
    /** Whether the view may be shown; true here. */
    virtual bool permitted();

    /** The name of another fallback state; empty, as here, for that of the constructor. */
    virtual QString fallbackTarget();

private:
    Q_DISABLE_COPY(HmiFallbackViewState)

    HmiFallbackTransition *m_fallbackTransition;
};

} // namespace HmiStateMachine
