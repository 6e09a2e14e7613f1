#pragma once

#include "journal.h"

#include <HmiStateMachineQuick/quickviewstatetarget.h>

#include <HmiStateMachine/named/statemachine.h>

#include <QVariant>

#include <memory>

class MessageRecorder;

namespace HmiStateMachine {
class HmiLayeredState;
class HmiViewState;
class NamedState;
class PopupState;
} // namespace HmiStateMachine

/**
 * The process-wide machine, which requests are posted to, over a QuickViewStateTarget: the layer
 * "Screens" with views and popups, and above it the layer "Overlay" with popups alone.
 *
 * The journal has what the target reports, as "viewActivated Home Radio", in which "none" stands
 * for an empty id. The line that every popup writes when it is shown is taken when the flow ends;
 * any other message that is left then fails the test.
 */
class QuickFlow
{
public:
    explicit QuickFlow(MessageRecorder &messages);
    ~QuickFlow();

    /** A view that follows back presses. */
    HmiStateMachine::HmiViewState *view(const QString &name);

    HmiStateMachine::PopupState *popup(const QString &name, const QString &viewId, int kind = 1);
    HmiStateMachine::PopupState *overlayPopup(const QString &name, const QString &viewId,
                                              int kind = 1);

    /** Starts in @p initial, at "Home" when it is null; the journal is empty afterwards. */
    void start(HmiStateMachine::HmiViewState *initial = nullptr);

    /** Post an event and let the machine settle. */
    void post(QEvent *event);
    void request(const QString &viewId, const QVariant &data = QVariant());
    void back(int depth = 1, const QString &targetId = QString());
    void requestPopup(const QString &name, const QVariant &data = QVariant());
    void dismiss(const QString &name);

    /** The journal so far, which is empty afterwards. */
    QStringList take();

    /** The texts of the messages since the last time, without the lines of shown popups. */
    QStringList takeMessages();

    /** The name of the active view state; empty when there is none. */
    static QString activeView();

private:
    MessageRecorder &m_messages;

public:
    Journal journal;
    HmiStateMachine::StateMachine *const machine = HmiStateMachine::StateMachine::instance();
    std::unique_ptr<HmiStateMachine::QuickViewStateTarget> target =
        std::make_unique<HmiStateMachine::QuickViewStateTarget>();
    HmiStateMachine::NamedState *unit;
    HmiStateMachine::HmiLayeredState *screens;
    HmiStateMachine::HmiLayeredState *overlay;
    HmiStateMachine::HmiViewState *home;

private:
    Q_DISABLE_COPY(QuickFlow)

    void record();
};

/** The ids in a list of popups, from the lowest, each with "(covered)" when it is. */
QStringList popupsIn(const HmiStateMachine::PopupListModel *model);
