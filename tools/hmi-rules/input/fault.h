#pragma once

#include <QString>

namespace hmirules {

/** Line and column from 1, the column in characters; a line of 0 is the file as a whole. */
struct TextPosition
{
    int line = 0;
    int column = 0;
};

/** Why an input cannot be used, and what to do about it. */
struct Fault
{
    QString file; ///< empty when it is not about a file
    TextPosition at;
    QString message;
    QString remedy;
};

/** The line for people: place, message and remedy. */
QString toText(const Fault &fault);

/** "file:line:column", or the file alone, for people. */
QString placeText(const QString &file, const TextPosition &at);

} // namespace hmirules
