#pragma once

#include <QStringList>

namespace hmirules {

/**
 * What to append to a message about a wrong name: ; did you mean "popup"? Empty when none of the
 * candidates comes close.
 */
QString didYouMean(const QString &name, const QStringList &candidates);

} // namespace hmirules
