#include <HmiStateMachine/hmi/hmitargetwhitelistfilter.h>

#include <algorithm>

namespace HmiStateMachine {

HmiTargetWhitelistFilter::HmiTargetWhitelistFilter(const QString &target) : m_patterns{target}
{
}

HmiTargetWhitelistFilter::~HmiTargetWhitelistFilter() = default;

bool HmiTargetWhitelistFilter::isValid(const QString &target) const
{
    return std::any_of(m_patterns.cbegin(), m_patterns.cend(),
                       [&target](const QString &pattern) { return pattern == target; });
}

} // namespace HmiStateMachine
