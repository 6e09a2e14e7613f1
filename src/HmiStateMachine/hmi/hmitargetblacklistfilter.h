#pragma once

#include <HmiStateMachine/hmi/hmitargetfilter.h>
#include <HmiStateMachine/hmistatemachine_export.h>

#include <QVector>

namespace HmiStateMachine {

/** Refuses one target, compared exactly. */
class HMISTATEMACHINE_EXPORT HmiTargetBlacklistFilter : public HmiTargetFilter
{
public:
    /** @p target is the name that is refused. */
    explicit HmiTargetBlacklistFilter(const QString &target);
    ~HmiTargetBlacklistFilter() override;

    bool isValid(const QString &target) const override;

private:
    Q_DISABLE_COPY(HmiTargetBlacklistFilter)

    QVector<QString> m_patterns;
};

} // namespace HmiStateMachine
