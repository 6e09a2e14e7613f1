#pragma once

/** Three screens and two popups, in StateMachine::instance(). */
void buildFlow();
