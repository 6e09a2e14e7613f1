#pragma once

#include "fault.h"

#include <QByteArray>

#include <vector>

namespace hmirules {

/** Finds line and column of any byte of a text, also of one that is a single long line. */
class TextIndex
{
public:
    explicit TextIndex(const QByteArray &text);

    TextPosition positionOf(int offset) const;

private:
    struct Mark
    {
        int offset;
        TextPosition at;
    };

    QByteArray m_text;
    std::vector<Mark> m_marks; ///< at the beginning of each line, and in between in long ones
};

} // namespace hmirules
