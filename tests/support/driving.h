#pragma once

class QAbstractState;
class QStateMachine;
class QTimer;

/**
 * Delivers what is posted, and deletes what is scheduled for deletion; fires no timer. A running
 * machine takes what is posted to it meanwhile too, so once is enough after any number of events.
 * What is posted to others meanwhile is delivered by the next call.
 */
void settle();

/** Starts @p machine in @p initial and lets it settle there. */
void startIn(QStateMachine &machine, QAbstractState *initial);

/** Lets an active timer run out now. False when it is not active, and nothing happens then. */
bool fire(QTimer *timer);

/**
 * Leaves @p machine stopped in an empty state of its own: a stopped machine still points to its
 * last states, so this comes before they are deleted.
 */
void park(QStateMachine &machine);
