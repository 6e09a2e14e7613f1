#pragma once

#include "fault.h"

#include <QByteArray>

namespace hmirules {

/** What an input may be long. A real file has some kilobytes; this keeps a wrong one out of memory.
 */
constexpr int maximumInputSize = 16 * 1024 * 1024;

/** How a file is called in messages. */
QString displayName(const QByteArray &path);

/**
 * Reads a file, a pipe, or the standard input for "-", once and to its end. False with a fault when
 * that fails or there is more than maximumInputSize.
 */
bool readInput(const QByteArray &path, QByteArray *content, Fault *fault);

} // namespace hmirules
