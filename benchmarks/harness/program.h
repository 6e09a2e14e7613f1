#pragma once

#include <QStringList>

/** Does what the arguments ask for; the program's exit code. */
int runProgram(const QStringList &arguments);
