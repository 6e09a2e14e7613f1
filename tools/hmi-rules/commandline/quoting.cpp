#include "commandline/quoting.h"

namespace hmirules {

QByteArray quoted(const QByteArray &text)
{
    QByteArray out = "\"";
    for (const char byte : text) {
        const auto code = static_cast<unsigned char>(byte);
        if (code < 0x20 || code == 0x7f) {
            out += "\\x" + QByteArray::number(code, 16).rightJustified(2, '0');
        } else {
            out += byte;
        }
    }
    return out + '"';
}

QByteArray enumerated(const QByteArrayList &words, const QByteArray &conjunction)
{
    return words.size() < 2
        ? words.join()
        : words.mid(0, words.size() - 1).join(", ") + ' ' + conjunction + ' ' + words.last();
}

} // namespace hmirules
