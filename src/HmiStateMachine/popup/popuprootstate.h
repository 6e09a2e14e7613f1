#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/namedstate.h>

#include <QList>

namespace HmiStateMachine {

class HmiSignalTransition;
class PopupState;
class PopupTransition;

/**
 * The layer in which popups live: exactly one of its children is active, the no-popup state or one
 * popup.
 *
 * A popup that is interrupted by another one of the layer returns when that one goes away, unless
 * it was dismissed meanwhile: the one that was in front last comes first. HmiLayeredState makes one
 * root a layer, and a root may also stand alone. Entering it leads to the no-popup state; leaving
 * it takes back everything that was shown, as handleReset() does.
 */
class HMISTATEMACHINE_EXPORT PopupRootState : public NamedState
{
    Q_OBJECT

public:
    /** The no-popup state is named "_NONEPOPUP". */
    explicit PopupRootState(QState *parent = nullptr);

    /** The no-popup state is named @p name followed by "_NONEPOPUP". */
    explicit PopupRootState(const QString &name, QState *parent = nullptr);
    ~PopupRootState() override;

    /** The child that is active while no popup is; made and owned by this root. */
    PopupState *noPopupState() const;

    /**
     * The child that was entered last, also when the layer has been left since; null until it is
     * entered.
     */
    PopupState *activePopupState() const;

    /** Whether @p popup is the child that was entered last; false for null. */
    bool isActivePopupState(const PopupState *popup) const;

    /** Lets @p popup be requested in this layer; null and a popup that is there are ignored. */
    void addPopupState(PopupState *popup);

    /** Takes @p popup out of the layer, to be called before it is deleted; closes it when active.
     */
    void removePopupState(PopupState *popup);

    /** Called by a popup when it is entered. */
    void setActivePopupState(PopupState *popup);

    /** Keeps @p popup from returning. */
    void deactivatePopupState(PopupState *popup);

    /** True when @p popup will not return; also for null. */
    bool wasDeactivated(PopupState *popup) const;

    /**
     * Has every popup of this layer that is shown, stacked or to return hidden by the view layer,
     * and forgets which were to return. What is entered stays entered.
     */
    void handleReset();

Q_SIGNALS:
    /** Emit it to throw the popup in front and all interrupted ones away. */
    void reset();

public Q_SLOTS:
    /** Dismisses the popup in front and forgets those that were to return. */
    void clearPopups();

protected:
    /** Leads to handleReset(). */
    void onExit(QEvent *event) override;

private:
    Q_DISABLE_COPY(PopupRootState)

    friend class PopupState;

    void build(const QString &name);
    void requestReturn();
    void attachResetTransition();
    void forgetDestroyed(PopupState *popup);

    PopupTransition *m_popupTransition = nullptr;
    PopupState *m_noPopupState = nullptr;
    PopupState *m_activePopupState = nullptr;
    HmiSignalTransition *m_resetTransition = nullptr;
    QList<QString> m_returnStack;
    QList<PopupState *> m_popups;
};

} // namespace HmiStateMachine
