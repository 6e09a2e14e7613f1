#include "commandline/suggestion.h"

#include <algorithm>
#include <QVector>

namespace hmirules {

namespace {

// How many letters are put in, left out or exchanged, by rows of the usual table.
int distance(const QByteArray &left, const QByteArray &right)
{
    QVector<int> above(right.size() + 1);
    for (int column = 0; column <= right.size(); ++column) {
        above[column] = column;
    }
    for (int row = 1; row <= left.size(); ++row) {
        QVector<int> current(right.size() + 1, row);
        for (int column = 1; column <= right.size(); ++column) {
            const int exchanged =
                above[column - 1] + (left.at(row - 1) == right.at(column - 1) ? 0 : 1);
            current[column] = std::min({exchanged, above[column] + 1, current[column - 1] + 1});
        }
        above = current;
    }
    return above.last();
}

} // namespace

QByteArray nearest(const QByteArray &word, const QByteArrayList &words)
{
    constexpr int longest = 64; // nobody mistypes more, and the table grows with the square
    if (word.size() > longest) {
        return QByteArray();
    }
    QByteArray best;
    int least = std::max(2, int(word.size()) / 3) + 1;
    for (const QByteArray &candidate : words) {
        const int steps = distance(word, candidate);
        if (steps < least) {
            least = steps;
            best = candidate;
        }
    }
    return best;
}

} // namespace hmirules
