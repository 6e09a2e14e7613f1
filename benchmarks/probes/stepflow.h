#pragma once

#include "machineflow.h"

#include <QAbstractTransition>

/** Takes the events of one type, and counts how often it was taken. */
class StepTransition : public QAbstractTransition
{
    Q_OBJECT

public:
    StepTransition(QEvent::Type type, int *taken, QState *source);

protected:
    bool eventTest(QEvent *event) override;
    void onTransition(QEvent *event) override;

private:
    QEvent::Type m_type;
    int *m_taken;
};

/**
 * A flow of bare states without a view layer's work, so that nothing but Qt's own shows. One
 * operation is one event; as many transitions as the probe says have to take it.
 */
class StepFlow : public MachineFlow
{
public:
    explicit StepFlow(int stepsPerEvent = 1) : m_stepsPerEvent(stepsPerEvent) { }
    ~StepFlow() override;

    void before(int operations) override;
    void run(int operations) override;
    void after() override;

protected:
    /** Lets the event lead from @p source to @p target. */
    StepTransition *addStep(QState *source, QAbstractState *target);

    /** A transition that tests every event and takes none. */
    StepTransition *addIdle(QState *source);

    /** Lets the event lead from either state to the other. */
    void addSteps(QState *one, QState *other);

    /** Two new children of @p parent with steps between them; the first is its initial state. */
    QState *addPair(QState *parent);

    void postStep();

private:
    int m_stepsPerEvent;
    int m_expected = 0;
    int m_taken = 0;
};
