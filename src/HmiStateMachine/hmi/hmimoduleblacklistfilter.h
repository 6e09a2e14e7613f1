#pragma once

#include <HmiStateMachine/hmi/hmitargetfilter.h>
#include <HmiStateMachine/hmistatemachine_export.h>

#include <QVector>

namespace HmiStateMachine {

/** Refuses every target that begins with the module, in the same case; whatever follows. */
class HMISTATEMACHINE_EXPORT HmiModuleBlacklistFilter : public HmiTargetFilter
{
public:
    /** @p module is what names of the module begin with; every name begins with an empty one. */
    explicit HmiModuleBlacklistFilter(const QString &module);
    ~HmiModuleBlacklistFilter() override;

    bool isValid(const QString &target) const override;

private:
    Q_DISABLE_COPY(HmiModuleBlacklistFilter)

    QVector<QString> m_patterns;
};

} // namespace HmiStateMachine
