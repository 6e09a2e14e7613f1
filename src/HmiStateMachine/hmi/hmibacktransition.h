#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>

#include <QAbstractTransition>

namespace HmiStateMachine {

/**
 * Takes back presses from the view that is active; HmiViewState makes its own and sets the target
 * on entry. Any HmiBackEvent fires it, whatever its depth; without a target the press is consumed.
 */
class HMISTATEMACHINE_EXPORT HmiBackTransition : public QAbstractTransition,
                                                 public NamedTargetTransitionBase
{
    Q_OBJECT

public:
    /** Hangs on @p source itself, also when that has layers. */
    explicit HmiBackTransition(QState *source = nullptr);
    ~HmiBackTransition() override;

protected:
    /** Accepts any HmiBackEvent. */
    bool eventTest(QEvent *event) override;

    /** Takes the transition off the list of firing ones. */
    void onTransition(QEvent *event) override;

public:
    QState *getSourceState() const override;
    void changeTarget(QState *target) override;
    QAbstractState *getTarget() const override;

private:
    Q_DISABLE_COPY(HmiBackTransition)
};

} // namespace HmiStateMachine
