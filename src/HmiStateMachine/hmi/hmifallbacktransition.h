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
    /** Hangs on @p source itself, also when that has layers. */
    explicit HmiFallbackTransition(QState *source = nullptr);
    ~HmiFallbackTransition() override;

protected:
    /**
     * Accepts any HmiFallbackEvent; one that names a state makes it the target, or leaves none when
     * the name is unknown.
     */
    bool eventTest(QEvent *event) override;

    /** Takes the transition off the list of firing ones. */
    void onTransition(QEvent *event) override;

public:
    QState *getSourceState() const override;
    void changeTarget(QState *target) override;
    QAbstractState *getTarget() const override;

private:
    Q_DISABLE_COPY(HmiFallbackTransition)
};

} // namespace HmiStateMachine
