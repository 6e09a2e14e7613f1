#pragma once

#include "viewlayer.h"
#include "workload.h"

#include <QStateMachine>

/** A flow on a machine: the machine, its view layer, and the way events are handed to it. */
class MachineFlow : public Flow
{
public:
    ~MachineFlow() override;

    quint64 checksum() const override { return m_layer.checksum(); }

protected:
    void start(QAbstractState *initial);
    void stop();

    /** Posts @p event and lets the machine run until it has nothing left to do. */
    void post(QEvent *event);

    QStateMachine &machine() { return m_machine; }
    ViewLayer &layer() { return m_layer; }

private:
    ViewLayer m_layer;
    QStateMachine m_machine;
};

/** A flow of the library, whose view layer is the instance of the process while it lives. */
class LibraryFlow : public MachineFlow
{
public:
    LibraryFlow();
    ~LibraryFlow() override;
};
