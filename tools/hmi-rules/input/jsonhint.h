#pragma once

#include <QByteArray>
#include <QString>

namespace hmirules {

/** Where and why a reader of JSON stopped. */
struct JsonStop
{
    QString reason; ///< in the reader's own words
    int offset = 0; ///< of what it read last
    int token = 0; ///< where what it could not take begins
};

/** A fault that people often make, in their words; without a message when it is none of these. */
struct JsonHint
{
    QString message;
    QString remedy;
    int offset = 0;
};

JsonHint jsonHint(const QByteArray &content, const JsonStop &stop);

} // namespace hmirules
