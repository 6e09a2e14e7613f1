#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>

#include <QAbstractTransition>

namespace HmiStateMachine {

/**
 * Takes requests for a view from the view that is active; HmiViewState makes its own.
 *
 * An HmiViewEvent leads to the state of that name or else to the view state that shows that view. A
 * request for the source itself makes it emit alreadyActive() and leaves the event to others; one
 * for an unknown view is consumed, and nothing moves.
 */
class HMISTATEMACHINE_EXPORT HmiViewTransition : public QAbstractTransition,
                                                 public NamedTargetTransitionBase
{
    Q_OBJECT

public:
    /** Hangs on @p source itself, also when that has layers. */
    explicit HmiViewTransition(QState *source = nullptr);
    ~HmiViewTransition() override;

    /** A blocked transition takes no request. */
    void setBlocked(bool blocked);

    /** Off at first. */
    bool blocked() const;

protected:
    /** Looks the requested view up and makes its state the target. */
    bool eventTest(QEvent *event) override;

    /** Takes the transition off the list of firing ones. */
    void onTransition(QEvent *event) override;

public:
    QState *getSourceState() const override;
    void changeTarget(QState *target) override;
    QAbstractState *getTarget() const override;

private:
    Q_DISABLE_COPY(HmiViewTransition)
};

} // namespace HmiStateMachine
