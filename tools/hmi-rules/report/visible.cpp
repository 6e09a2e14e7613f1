#include "visible.h"

namespace hmirules {

bool isInvisible(QChar character)
{
    switch (character.category()) {
    case QChar::Other_Control:
    case QChar::Other_Format:
    case QChar::Separator_Line:
    case QChar::Separator_Paragraph:
        return true;
    default:
        return false;
    }
}

QString visible(const QString &text)
{
    constexpr int digits = 4;
    constexpr int hexadecimal = 16;
    QString result;
    for (const QChar character : text) {
        if (isInvisible(character)) {
            result += QString("\\u%1").arg(character.unicode(), digits, hexadecimal, QChar('0'));
        } else {
            result += character;
        }
    }
    return result;
}

} // namespace hmirules
