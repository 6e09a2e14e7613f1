#include "driving.h"

#include <QCoreApplication>
#include <QState>
#include <QStateMachine>
#include <QTimer>
#include <QTimerEvent>

void settle()
{
    QCoreApplication::sendPostedEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

void startIn(QStateMachine &machine, QAbstractState *initial)
{
    machine.setInitialState(initial);
    machine.start();
    settle();
}

bool fire(QTimer *timer)
{
    if (!timer || !timer->isActive()) {
        return false;
    }
    QTimerEvent event(timer->timerId());
    QCoreApplication::sendEvent(timer, &event);
    return true;
}

void park(QStateMachine &machine)
{
    machine.stop();
    settle();
    const QString name = QStringLiteral("parkingState");
    auto *parking = machine.findChild<QState *>(name, Qt::FindDirectChildrenOnly);
    if (!parking) {
        parking = new QState(&machine);
        parking->setObjectName(name);
    }
    startIn(machine, parking);
    machine.stop();
    settle();
}
