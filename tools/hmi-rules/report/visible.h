#pragma once

#include <QString>

namespace hmirules {

/** Whether a character leaves no mark, or moves the cursor; a blank is none of these. */
bool isInvisible(QChar character);

/** A text for one line of a terminal: what cannot be seen is written as \u200b. */
QString visible(const QString &text);

} // namespace hmirules
