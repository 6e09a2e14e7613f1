#pragma once

#include "rules/rulebase.h"

#include <memory>

namespace hmirules {

/** The rules of files that are loaded one after another; null with a fault. */
std::unique_ptr<RuleBase> loadRules(const QList<QByteArray> &paths, Fault *fault);

} // namespace hmirules
