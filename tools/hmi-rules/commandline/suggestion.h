#pragma once

#include <QByteArrayList>

namespace hmirules {

/** The one of the words that was most likely meant; empty when none comes near. */
QByteArray nearest(const QByteArray &word, const QByteArrayList &words);

} // namespace hmirules
