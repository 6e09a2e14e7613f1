#pragma once

#include <QString>
#include <QStringList>

namespace hmirules {

/**
 * The names under which the library looks a popup up, in their order: its own, its popup in any
 * module, any popup of its module.
 */
QStringList keysOf(const QString &popup);

/** Whether a name is one of those wildcards under which popups are looked up. */
bool isWildcard(const QString &name);

/** Whether @p popup is looked up under @p pattern, which may be its own name. */
bool matches(const QString &pattern, const QString &popup);

/** "Prohibit" and so on; "invalid" for anything else. */
QString behaviorText(int behavior);

} // namespace hmirules
