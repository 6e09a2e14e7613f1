#pragma once

#include "driving.h"
#include "journal.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QList>

/**
 * The process-wide machine, which fallback views post to, with the views "Home" and "Fallback". It
 * is parked at the end, and its views are deleted.
 */
class FallbackFlow
{
public:
    FallbackFlow() = default;

    ~FallbackFlow()
    {
        park(*machine);
        qDeleteAll(views);
    }

    /** Has @p view go with the flow. */
    template <typename View> View *add(View *view)
    {
        views.append(view);
        return view;
    }

    /** Starts in @p initial; the journal is empty afterwards. */
    void start(HmiStateMachine::HmiViewState *initial)
    {
        startIn(*machine, initial);
        journal.clear();
    }

    /** Posts @p event and lets the machine settle. */
    void post(QEvent *event)
    {
        machine->postEvent(event);
        settle();
    }

    void request(const QString &viewId)
    {
        post(new HmiStateMachine::HmiViewEvent(viewId, QVariant()));
    }

    /** The journal so far, which is empty afterwards. */
    QStringList take()
    {
        const QStringList lines = journal.lines();
        journal.clear();
        return lines;
    }

    HmiStateMachine::StateMachine *const machine = HmiStateMachine::StateMachine::instance();
    Journal journal;
    RecordingViewStateTarget target{journal};
    QList<HmiStateMachine::HmiViewState *> views;
    HmiStateMachine::HmiViewState *const home =
        add(new HmiStateMachine::HmiViewState(QStringLiteral("Home"), machine));
    HmiStateMachine::HmiViewState *const fallback =
        add(new HmiStateMachine::HmiViewState(QStringLiteral("Fallback"), machine));

private:
    Q_DISABLE_COPY(FallbackFlow)
};
