#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>

#include <QString>

namespace HmiStateMachine {

/**
 * Decides whether a view may serve as a back target; see HmiViewState::addBackTargetFilter(). One
 * filter may be shared by several views.
 */
class HMISTATEMACHINE_EXPORT HmiTargetFilter
{
public:
    /** For subclasses. */
    HmiTargetFilter() = default;

    /** Called when nobody shares the filter any more. */
    virtual ~HmiTargetFilter();

    /** @p target is the name of a view state. */
    virtual bool isValid(const QString &target) const = 0;

private:
    Q_DISABLE_COPY(HmiTargetFilter)
};

} // namespace HmiStateMachine
