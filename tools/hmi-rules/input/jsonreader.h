#pragma once

#include "fault.h"
#include "jsonnode.h"
#include "textindex.h"

#include <QByteArray>

namespace hmirules {

/**
 * Reads a JSON text with the place of each value. It is stricter than the library's own reader,
 * which takes line breaks within texts, for one: what it refuses is no JSON for editors and other
 * tools. False with a fault, of which the file is not set.
 */
bool readJson(const QByteArray &content, const TextIndex &index, JsonNode *root, Fault *fault);

} // namespace hmirules
