#pragma once

#include <QByteArrayList>

namespace hmirules {

/** Lines of at most @p width characters; a longer word has a line of its own. */
QByteArrayList wrapped(const QByteArray &text, int width);

/** The texts between empty lines. */
QByteArrayList paragraphs(const QByteArray &text);

} // namespace hmirules
