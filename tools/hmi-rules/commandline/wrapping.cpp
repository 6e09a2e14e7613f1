#include "commandline/wrapping.h"

namespace hmirules {

QByteArrayList wrapped(const QByteArray &text, int width)
{
    QByteArrayList lines;
    QByteArray line;
    for (const QByteArray &word : text.simplified().split(' ')) {
        if (!line.isEmpty() && line.size() + 1 + word.size() > width) {
            lines.append(line);
            line.clear();
        }
        line += (line.isEmpty() ? "" : " ") + word;
    }
    lines.append(line);
    return lines;
}

QByteArrayList paragraphs(const QByteArray &text)
{
    QByteArrayList found;
    int start = 0;
    for (int end = text.indexOf("\n\n"); end >= 0; end = text.indexOf("\n\n", start)) {
        found.append(text.mid(start, end - start));
        start = end + 2;
    }
    found.append(text.mid(start));
    return found;
}

} // namespace hmirules
