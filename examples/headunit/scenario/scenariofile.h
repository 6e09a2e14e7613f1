#pragma once

#include "fault.h"

#include <QStringList>

#include <optional>

namespace headunit {

/** The lines of a text file in UTF-8, the first one at index 0. */
std::optional<LocatedFault> readScenarioFile(const QString &path, QStringList *lines);

} // namespace headunit
