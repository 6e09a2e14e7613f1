#include "guess.h"

#include <algorithm>
#include <numeric>
#include <vector>

namespace hmirules {

namespace {

// The least number of characters to insert, remove or replace.
int distance(const QString &a, const QString &b)
{
    std::vector<int> row(static_cast<std::size_t>(b.size()) + 1);
    std::iota(row.begin(), row.end(), 0);
    for (int i = 0; i < a.size(); ++i) {
        int diagonal = row[0]++;
        for (int j = 0; j < b.size(); ++j) {
            const auto at = static_cast<std::size_t>(j);
            const int replaced = diagonal + (a.at(i) == b.at(j) ? 0 : 1);
            diagonal = row[at + 1];
            row[at + 1] = std::min({replaced, row[at] + 1, row[at + 1] + 1});
        }
    }
    return row.back();
}

} // namespace

QString didYouMean(const QString &name, const QStringList &candidates)
{
    constexpr int longest = 200; // of what can be a typing error
    constexpr int share = 3; // of the characters may be wrong: one in three
    if (name.isEmpty() || name.size() > longest) {
        return QString();
    }
    QString best;
    int least = std::max(2, name.size() / share); // two letters exchanged are two wrong ones
    for (const QString &candidate : candidates) {
        const int wrong = distance(name.toCaseFolded(), candidate.toCaseFolded());
        if (wrong <= least && wrong < candidate.size() && candidate != name
            && (best.isEmpty() || wrong < least)) {
            least = wrong;
            best = candidate;
        }
    }
    return best.isEmpty() ? QString() : "; did you mean \"" + best + "\"?";
}

} // namespace hmirules
