#include "finding.h"

#include <algorithm>
#include <tuple>

namespace hmirules {

std::vector<int> Findings::files() const
{
    std::vector<int> numbers;
    for (int number = m_firstFile; number < static_cast<int>(m_base.files().size()); ++number) {
        numbers.push_back(number);
    }
    return numbers;
}

void Findings::add(const char *id, const Place &place, const QString &message,
                   const std::vector<Related> &related, const QString &remedy)
{
    if (place.file < m_firstFile) {
        return;
    }
    const FindingKind *kind = findingKind(id);
    m_findings.push_back({kind, place, message, remedy.isEmpty() ? kind->remedy : remedy, related});
}

std::vector<Finding> Findings::takeSorted()
{
    std::stable_sort(m_findings.begin(), m_findings.end(), [](const Finding &a, const Finding &b) {
        return std::tie(a.place.file, a.place.at.line, a.place.at.column)
            < std::tie(b.place.file, b.place.at.line, b.place.at.column);
    });
    return std::move(m_findings);
}

} // namespace hmirules
