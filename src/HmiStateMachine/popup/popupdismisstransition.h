#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/identifier.h>

#include <QAbstractTransition>
#include <QString>

namespace HmiStateMachine {

class PopupState;

/**
 * Closes its popup when a PopupEvent names the popup's dismiss identifier, that of its view, or
 * "DismissAnyPopup". Every PopupState has one.
 *
 * While the popup is not active the transition hangs on the popup's root without a target: a
 * dismiss event then keeps a waiting popup from returning, and moves nothing.
 */
class HMISTATEMACHINE_EXPORT PopupDismissTransition : public QAbstractTransition
{
    Q_OBJECT

public:
    /** What follows a popup's name in its dismiss identifier, "_Dismiss". */
    static const QString dismissEventSigniture;

    /** The identifier that dismisses any popup, "DismissAnyPopup". */
    static const QString dismissEventWildCard;

    /** Belongs to @p popup, which is its source too; null makes a transition that does nothing. */
    explicit PopupDismissTransition(PopupState *popup);
    ~PopupDismissTransition() override;

    /**
     * @p s followed by "_Dismiss" becomes the dismiss identifier; with an empty one there is none.
     */
    void setDismissTarget(const QString &s);

    /** The same for the identifier by the popup's view. */
    void setDismissView(const QString &s);

    /** The dismiss identifier; empty when the popup cannot be dismissed. */
    QString dismissTargetSigniture() const;

    /** Whether there is a dismiss identifier. */
    bool isDismissable() const;

    /** Whether @p e dismisses this popup. An event with an empty target dismisses none. */
    bool isDismissEvent(QEvent *e) const;

public Q_SLOTS:
    /** Follows a change of the popup's name. */
    void sourceNameChanged(Identifier identifier);

    /**
     * Posts the dismiss event to the machine of the popup; nothing while it belongs to none.
     * Without a dismiss identifier the event dismisses nothing.
     */
    void trigger();

protected:
    /**
     * Gives the popup up by PopupState::deactivate() when @p event dismisses it, and accepts it
     * when the popup is the active child of its root. An event of another kind is refused, and
     * changes nothing.
     */
    bool eventTest(QEvent *event) override;

    /** Does nothing. */
    void onTransition(QEvent *event) override;

private:
    Q_DISABLE_COPY(PopupDismissTransition)

    QString m_dismissTarget;
    QString m_dismissView;
    PopupState *m_popup;
};

} // namespace HmiStateMachine
