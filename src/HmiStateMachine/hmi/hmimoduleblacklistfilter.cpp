#include <HmiStateMachine/hmi/hmimoduleblacklistfilter.h>

#include <algorithm>

namespace HmiStateMachine {

HmiModuleBlacklistFilter::HmiModuleBlacklistFilter(const QString &module) : m_patterns{module}
{
}

HmiModuleBlacklistFilter::~HmiModuleBlacklistFilter() = default;

bool HmiModuleBlacklistFilter::isValid(const QString &target) const
{
    return std::none_of(m_patterns.cbegin(), m_patterns.cend(), [&target](const QString &pattern) {
        return target.startsWith(pattern, Qt::CaseSensitive);
    });
}

} // namespace HmiStateMachine
