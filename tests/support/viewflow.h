#pragma once

#include "journal.h"
#include "recordingviewstatetarget.h"

#include <QStateMachine>
#include <QVariant>

class QState;

namespace HmiStateMachine {
class GuardedTransition;
class HmiViewState;
} // namespace HmiStateMachine

/**
 * A machine of view states over a recording view layer, one journal for both.
 *
 * Beside the lines of the view layer the journal has those of the back stacks: "Radio backStackPush
 * Home", "Radio backStackPop".
 */
class ViewFlow
{
public:
    /** A view state in @p parent, or else in the machine. */
    HmiStateMachine::HmiViewState *view(const QString &name, QState *parent = nullptr);

    /** The same, following back presses. */
    HmiStateMachine::HmiViewState *backView(const QString &name, QState *parent = nullptr);

    /** A view state that shows @p targetView, following back presses. */
    HmiStateMachine::HmiViewState *viewOf(const QString &targetView, const QString &name);

    /** Writes the back stack signals of @p view to the journal. */
    void record(HmiStateMachine::HmiViewState *view);

    /** Starts the machine in @p initial, at any depth; the journal is empty afterwards. */
    void start(QState *initial);

    /** Post an event and let the machine settle. */
    void request(const QString &viewId, const QVariant &data = QVariant());
    void back(int depth = 1, const QString &targetId = QString());
    void post(QEvent *event);

    /** The journal so far, which is empty afterwards. */
    QStringList take();

    /** The name of the active view state; empty when there is none. */
    static QString activeView();

    Journal journal;
    RecordingViewStateTarget target{journal};
    QStateMachine machine;
};

/** Lets an event of @p type lead from @p source to @p goal. */
void lead(QEvent::Type type, QState *source, QAbstractState *goal);

/** Lets @p source be left for @p goal, without an event, as soon as it is entered. */
HmiStateMachine::GuardedTransition *leadOnAtOnce(QState *source, QAbstractState *goal);
