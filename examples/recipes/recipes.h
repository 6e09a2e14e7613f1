#pragma once

class QAbstractState;
class QTimer;

void backFilters();
void blockedKeys();
void conditions();
void dataAndRefresh();
void delayedTransitions();
void domains();
void driverRestriction();
void fallbacks();
void otherThreads();
void seeing();
void siblings();

/** Starts StateMachine::instance() in @p initial. */
void startIn(QAbstractState *initial);

/** Lets a timer run out now. False when it does not run. */
bool fire(QTimer *timer);
