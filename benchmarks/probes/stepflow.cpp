#include "stepflow.h"

namespace {

constexpr auto stepType = QEvent::Type(QEvent::User + 400);
constexpr auto neverPosted = QEvent::Type(QEvent::User + 401);

} // namespace

StepTransition::StepTransition(QEvent::Type type, int *taken, QState *source)
    : QAbstractTransition(source), m_type(type), m_taken(taken)
{
}

bool StepTransition::eventTest(QEvent *event)
{
    return event->type() == m_type;
}

void StepTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
    ++*m_taken;
}

StepFlow::~StepFlow()
{
    stop();
    qDeleteAll(machine().findChildren<QState *>(QString(), Qt::FindDirectChildrenOnly));
}

void StepFlow::before(int operations)
{
    m_taken = 0;
    m_expected = operations * m_stepsPerEvent;
}

void StepFlow::run(int operations)
{
    for (int i = 0; i < operations; ++i) {
        postStep();
    }
}

// There is no view layer's checksum here: a shape that does not move would measure nothing.
void StepFlow::after()
{
    if (m_taken != m_expected) {
        qFatal("A probe has taken %d transitions instead of %d", m_taken, m_expected);
    }
}

StepTransition *StepFlow::addStep(QState *source, QAbstractState *target)
{
    auto *step = new StepTransition(stepType, &m_taken, source);
    step->setTargetState(target);
    return step;
}

StepTransition *StepFlow::addIdle(QState *source)
{
    return new StepTransition(neverPosted, &m_taken, source);
}

void StepFlow::addSteps(QState *one, QState *other)
{
    addStep(one, other);
    addStep(other, one);
}

QState *StepFlow::addPair(QState *parent)
{
    auto *first = new QState(parent);
    addSteps(first, new QState(parent));
    if (parent != &machine()) {
        parent->setInitialState(first);
    }
    return first;
}

void StepFlow::postStep()
{
    post(new QEvent(stepType));
}
