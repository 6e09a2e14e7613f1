#pragma once

#include <QByteArrayList>

namespace hmirules {

/** In quotation marks, and harmless to a terminal: control characters become "\x1b". */
QByteArray quoted(const QByteArray &text);

/** "a, b and c", or with another conjunction. */
QByteArray enumerated(const QByteArrayList &words, const QByteArray &conjunction);

} // namespace hmirules
