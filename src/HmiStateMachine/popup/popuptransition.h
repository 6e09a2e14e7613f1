#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>

#include <QAbstractTransition>
#include <QHash>
#include <QString>

namespace HmiStateMachine {

class PopupEvent;
class PopupState;

/**
 * Decides whether a requested popup may come up. A popup root has one, which always leads away from
 * the child that is active.
 *
 * The popup in front of the whole system, of whichever layer, rules over the request; so do those
 * that the view layer keeps stacked, and the active domain. A popup that returns is
 * refused by neither the popup in front nor the domain, but one that is stacked may prohibit it.
 */
class HMISTATEMACHINE_EXPORT PopupTransition : public QAbstractTransition
{
    Q_OBJECT

public:
    /** Without a source; the root hangs it on the child that is active. */
    PopupTransition();
    ~PopupTransition() override;

    /**
     * Adds @p popup under the name that it has now; a later change of its name is not followed. The
     * first popup of a name keeps it. Null is ignored.
     */
    void addTarget(PopupState *popup);

    /** Removes @p popup, and whatever is known under its name. Null is ignored. */
    void removeTarget(PopupState *popup);

    /** Whether a popup that is stacked prohibits @p popup; false without a view layer. */
    bool blockedByStacked(PopupState *popup) const;

protected:
    /**
     * Accepts the request for a popup that may come up. One for the popup that is the active child
     * brings it new data, and one for a popup of another layer is left to that layer.
     */
    bool eventTest(QEvent *event) override;

    /** Does nothing. */
    void onTransition(QEvent *event) override;

private:
    Q_DISABLE_COPY(PopupTransition)

    bool grant(PopupState *popup, bool reactivation);
    bool refuse(PopupState *popup, const PopupState *front);

    QHash<QString, PopupState *> m_targets;
};

} // namespace HmiStateMachine
