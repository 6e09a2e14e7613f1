#pragma once

#include <HmiStateMachine/hmi/hmitargetfilter.h>
#include <HmiStateMachine/hmistatemachine_export.h>

#include <QVector>

namespace HmiStateMachine {

/** Accepts every target that begins with the module, in the same case, and no other. */
class HMISTATEMACHINE_EXPORT HmiModuleWhitelistFilter : public HmiTargetFilter
{
public:
    /** @p module is what names of the module begin with; every name begins with an empty one. */
    explicit HmiModuleWhitelistFilter(const QString &module);
    ~HmiModuleWhitelistFilter() override;

    bool isValid(const QString &target) const override;

private:
    Q_DISABLE_COPY(HmiModuleWhitelistFilter)

    QVector<QString> m_patterns;
};

} // namespace HmiStateMachine
