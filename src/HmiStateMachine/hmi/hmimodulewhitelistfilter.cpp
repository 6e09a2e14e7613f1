#include <HmiStateMachine/hmi/hmimodulewhitelistfilter.h>

#include <algorithm>

namespace HmiStateMachine {

HmiModuleWhitelistFilter::HmiModuleWhitelistFilter(const QString &module) : m_patterns{module}
{
}

HmiModuleWhitelistFilter::~HmiModuleWhitelistFilter() = default;

bool HmiModuleWhitelistFilter::isValid(const QString &target) const
{
    return std::any_of(m_patterns.cbegin(), m_patterns.cend(), [&target](const QString &pattern) {
        return target.startsWith(pattern, Qt::CaseSensitive);
    });
}

} // namespace HmiStateMachine
