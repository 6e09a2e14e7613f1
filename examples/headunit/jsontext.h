#pragma once

#include <QString>
#include <QVariant>

namespace headunit {

/**
 * The value that a JSON text stands for: an object, an array or a single value. Invalid when the
 * text is not JSON; @p error then tells why.
 */
QVariant fromJsonText(const QString &text, QString *error);

/** One line of JSON, the keys in alphabetical order, values that JSON cannot express left out. */
QString toJsonText(const QVariant &value);

} // namespace headunit
