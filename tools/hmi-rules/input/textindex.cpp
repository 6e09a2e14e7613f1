#include "textindex.h"

#include <algorithm>

namespace hmirules {

namespace {

constexpr int distanceOfMarks = 4096; // what is counted at most for one position

// A byte that goes on with a character of UTF-8 does not begin a column.
bool beginsCharacter(char byte)
{
    return (static_cast<unsigned char>(byte) & 0xc0U) != 0x80U;
}

void advance(char byte, TextPosition *at)
{
    if (byte == '\n') {
        ++at->line;
        at->column = 1;
    } else if (beginsCharacter(byte)) {
        ++at->column;
    }
}

} // namespace

TextIndex::TextIndex(const QByteArray &text) : m_text(text)
{
    constexpr int byteOrderMarkSize = 3;
    const int begin = text.startsWith("\xef\xbb\xbf") ? byteOrderMarkSize : 0;
    TextPosition at = {1, 1};
    m_marks.push_back({begin, at});
    for (int offset = begin; offset < text.size(); ++offset) {
        advance(text.at(offset), &at);
        const bool lineBegins = text.at(offset) == '\n';
        if (lineBegins || offset + 1 - m_marks.back().offset >= distanceOfMarks) {
            m_marks.push_back({offset + 1, at});
        }
    }
}

TextPosition TextIndex::positionOf(int offset) const
{
    const auto after =
        std::upper_bound(m_marks.cbegin() + 1, m_marks.cend(), offset,
                         [](int wanted, const Mark &mark) { return wanted < mark.offset; });
    const Mark &mark = *(after - 1);
    TextPosition at = mark.at;
    for (int i = mark.offset; i < std::min(offset, m_text.size()); ++i) {
        advance(m_text.at(i), &at);
    }
    return at;
}

} // namespace hmirules
