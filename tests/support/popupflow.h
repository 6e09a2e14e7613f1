#pragma once

#include "journal.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/popup/popupstate.h>

#include <QByteArray>
#include <QStateMachine>
#include <QVariant>

class MessageRecorder;

namespace HmiStateMachine {
class NamedState;
class PopupRootState;
} // namespace HmiStateMachine

/**
 * A machine with two popup layers side by side, over a recording view layer.
 *
 * The line that every popup writes when it is shown is taken when the flow ends; any other message
 * that is left then fails the test. Rules are kept as long as the process lives, so each test
 * function has popup names of its own.
 */
class PopupFlow
{
public:
    explicit PopupFlow(MessageRecorder &messages);
    ~PopupFlow();

    /** A popup of the lower layer, with a popup view id other than its name. */
    HmiStateMachine::PopupState *popup(const QString &name, const QString &viewId, int kind = 1);
    HmiStateMachine::PopupState *upperPopup(const QString &name, const QString &viewId,
                                            int kind = 1);

    /** Writes the signals of @p popup to the journal, as "<view id> aboutToBeActivated". */
    void record(HmiStateMachine::PopupState *popup);

    /** Enters both layers; the journal is empty afterwards. */
    void start();

    /** Posts a PopupEvent, also one that dismisses, and lets the machine settle. */
    void request(const QString &name, const QVariant &data = QVariant());
    void requestAgain(const QString &name, const QVariant &data = QVariant());

    /** Leave both layers for another state, and return to them. */
    void leave();
    void comeBack();

    /** What was called on the view layer, and signalled, since the last time. */
    QStringList take();

    /** The messages since the last time, without the lines of shown popups. */
    QStringList takeMessages();

    /** What @p front answers a request for @p requested. */
    static void rule(const QString &front, HmiStateMachine::PopupState::InterruptionBehavior answer,
                     const QString &requested);

    /** Blacklists can only be given as a file. */
    static void load(const QByteArray &json);

private:
    MessageRecorder &m_messages;

public:
    Journal journal;
    RecordingViewStateTarget target{journal};
    QStateMachine machine;
    HmiStateMachine::NamedState *work;
    HmiStateMachine::NamedState *away;
    HmiStateMachine::PopupRootState *lower;
    HmiStateMachine::PopupRootState *upper;
};
