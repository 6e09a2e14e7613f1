#include "docgen/roff.h"

namespace hmirules {

QByteArray roff(const QByteArray &text)
{
    QByteArray out;
    for (int i = 0; i < text.size(); ++i) {
        const char letter = text.at(i);
        const bool startsLine = i == 0 || text.at(i - 1) == '\n';
        switch (letter) {
        case '\\':
            out += "\\(rs";
            break;
        case '-':
            out += "\\-";
            break;
        case '\'':
            out += "\\(aq";
            break;
        case '`':
            out += "\\(ga";
            break;
        case '"':
            out += "\\(dq";
            break;
        case '^':
            out += "\\(ha";
            break;
        case '~':
            out += "\\(ti";
            break;
        // A line that begins with a full stop is a request.
        case '.':
            out += startsLine ? "\\&." : ".";
            break;
        default:
            out += letter;
            break;
        }
    }
    return out;
}

QByteArray bold(const QByteArray &text)
{
    return "\\fB" + roff(text) + "\\fR";
}

QByteArray italic(const QByteArray &text)
{
    return "\\fI" + roff(text) + "\\fR";
}

} // namespace hmirules
