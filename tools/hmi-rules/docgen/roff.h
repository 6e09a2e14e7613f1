#pragma once

#include <QByteArray>

namespace hmirules {

/** Text as roff prints it letter by letter: hyphens and quotes stay what one can copy and paste. */
QByteArray roff(const QByteArray &text);

QByteArray bold(const QByteArray &text);
QByteArray italic(const QByteArray &text);

} // namespace hmirules
