#include <HmiStateMachine/hmi/hmitargetblacklistfilter.h>

#include <algorithm>

namespace HmiStateMachine {

HmiTargetBlacklistFilter::HmiTargetBlacklistFilter(const QString &target) : m_patterns{target}
{
}

HmiTargetBlacklistFilter::~HmiTargetBlacklistFilter() = default;

bool HmiTargetBlacklistFilter::isValid(const QString &target) const
{
    return std::none_of(m_patterns.cbegin(), m_patterns.cend(),
                        [&target](const QString &pattern) { return pattern == target; });
}

} // namespace HmiStateMachine
