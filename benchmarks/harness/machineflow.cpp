#include "machineflow.h"

#include <QCoreApplication>

MachineFlow::~MachineFlow() = default;

void MachineFlow::start(QAbstractState *initial)
{
    m_machine.setInitialState(initial);
    m_machine.start();
    QCoreApplication::sendPostedEvents();
}

void MachineFlow::stop()
{
    m_machine.stop();
    QCoreApplication::sendPostedEvents();
}

void MachineFlow::post(QEvent *event)
{
    m_machine.postEvent(event);
    QCoreApplication::sendPostedEvents();
}

LibraryFlow::LibraryFlow()
{
    HmiStateMachine::ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = &layer();
}

LibraryFlow::~LibraryFlow()
{
    HmiStateMachine::ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;
}
