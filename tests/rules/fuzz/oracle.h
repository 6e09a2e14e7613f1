#pragma once

#include "rules/rulebase.h"

/** Ends the program, by which libFuzzer keeps the input, when something does not hold. */
void require(bool holds, const char *what);

/** Holds of any text that the tool has read, compared with a store that has it too. */
void checkAnswers(const hmirules::RuleBase &base,
                  const HmiStateMachine::PopupInterruptionStore &store);

/** Writes all reports about it. */
void checkReports(const hmirules::RuleBase &base);
