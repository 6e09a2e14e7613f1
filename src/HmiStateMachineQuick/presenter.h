#pragma once

#include <HmiStateMachineQuick/hmistatemachinequick_export.h>

#include <QString>

namespace HmiStateMachine {

/**
 * What shows views for a QuickViewStateTarget; ScreenHost is one. It answers by the target's
 * operations reportViewAnimationStarted(), reportViewShown() and reportLoadError().
 */
class HMISTATEMACHINEQUICK_EXPORT ViewPresenter
{
public:
    /** It withdraws from the target first: see QuickViewStateTarget::setViewPresenter(). */
    virtual ~ViewPresenter();

    /** Shows the target's active view in place of what is shown; @p back when a back press led to
     * it.
     */
    virtual void presentView(const QString &viewId, bool back) = 0;

    /** Whether something is being loaded or moves. */
    virtual bool isBusy() const = 0;
};

/**
 * What shows popups for a QuickViewStateTarget; PopupHost is one. It answers by the target's
 * operations reportPopupAnimationStarted(), reportPopupShown(), reportPopupHidden() and
 * reportLoadError().
 */
class HMISTATEMACHINEQUICK_EXPORT PopupPresenter
{
public:
    /** It withdraws from the target first: see QuickViewStateTarget::setPopupPresenter(). */
    virtual ~PopupPresenter();

    /** Shows an entry of the target's shown popups, on top of all others. */
    virtual void presentPopup(const QString &popupId) = 0;

    /** Takes a popup away that has left the target's shown popups. */
    virtual void withdrawPopup(const QString &popupId) = 0;

    /** Whether something is being loaded or moves. */
    virtual bool isBusy() const = 0;
};

} // namespace HmiStateMachine
