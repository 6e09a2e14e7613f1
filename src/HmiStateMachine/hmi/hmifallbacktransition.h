#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>

#include <QAbstractTransition>

namespace HmiStateMachine {

/**
 * Leads away from a view that may not be shown, on an HmiFallbackEvent: to the state that the event
 * names, or else to the one that was set last.
 */
class HMISTATEMACHINE_EXPORT HmiFallbackTransition : public QAbstractTransition,
                                                     public NamedTargetTransitionBase
{
    Q_OBJECT

public:
    explicit HmiFallbackTransition(QState *source = nullptr);
    ~HmiFallbackTransition() override;

protected:
    bool eventTest(QEvent *event) override;
    void onTransition(QEvent *event) override;

public:
    QState *getSourceState() const override;
    void changeTarget(QState *target) override;
    QAbstractState *getTarget() const override;

private:
    Q_DISABLE_COPY(HmiFallbackTransition)
};

} // namespace HmiStateMachine
