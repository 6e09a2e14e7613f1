#pragma once

#include <HmiStateMachine/hmi/hmitargetfilter.h>
#include <HmiStateMachine/hmistatemachine_export.h>

#include <QVector>

namespace HmiStateMachine {

/** Accepts one target, compared exactly, and no other. */
class HMISTATEMACHINE_EXPORT HmiTargetWhitelistFilter : public HmiTargetFilter
{
public:
    /** @p target is the name that is accepted. */
    explicit HmiTargetWhitelistFilter(const QString &target);
    ~HmiTargetWhitelistFilter() override;

    bool isValid(const QString &target) const override;

private:
    Q_DISABLE_COPY(HmiTargetWhitelistFilter)

    QVector<QString> m_patterns;
};

} // namespace HmiStateMachine
