#pragma once

#include <QString>

namespace hmirules {

/** The text of a file that is made into the program, see hmirules.qrc. */
QString resource(const QString &name);

} // namespace hmirules
