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
    explicit HmiViewTransition(QState *source = nullptr);
    ~HmiViewTransition() override;

    /** A blocked transition takes no request. */
    void setBlocked(bool blocked);
    bool blocked() const;

protected:
    bool eventTest(QEvent *event) override;
    void onTransition(QEvent *event) override;

public:
    QState *getSourceState() const override;
    void changeTarget(QState *target) override;
    QAbstractState *getTarget() const override;

private:
    Q_DISABLE_COPY(HmiViewTransition)
};

} // namespace HmiStateMachine
