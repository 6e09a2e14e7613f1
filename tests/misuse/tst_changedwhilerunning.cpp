#include "driving.h"
#include "emitter.h"
#include "goingon.h"
#include "librarytest.h"
#include "popupflow.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QtTest>

#include <memory>

using namespace HmiStateMachine;

/** Parts of the flow that come and go while it runs. */
class tst_ChangedWhileRunning : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aTransitionAddedToAnActiveStateFires();
    void aSignalTransitionAddedToAnActiveStateFires();
    void aTransitionRemovedFromAnActiveStateFiresNoMore();
    void aPopupAddedWhileTheLayerIsActiveIsRequested();
    void aViewAddedWhileTheMachineRunsIsRequested();
};

void tst_ChangedWhileRunning::aTransitionAddedToAnActiveStateFires()
{
    TwoStates flow;
    flow.start();
    goOn(flow);

    post(flow);

    QVERIFY(flow.target->isActive());
}

void tst_ChangedWhileRunning::aSignalTransitionAddedToAnActiveStateFires()
{
    Emitter emitter;
    TwoStates flow;
    flow.start();
    flow.source->addTransition(&emitter, SIGNAL(plain()), flow.target);
    settle();

    Q_EMIT emitter.plain();
    settle();

    QVERIFY(flow.target->isActive());
}

void tst_ChangedWhileRunning::aTransitionRemovedFromAnActiveStateFiresNoMore()
{
    Emitter emitter;
    TwoStates flow;
    const std::unique_ptr<HmiSignalTransition> transition(
        flow.source->addTransition(&emitter, SIGNAL(plain()), flow.target));
    flow.start();

    flow.source->removeTransition(transition.get());
    Q_EMIT emitter.plain();
    settle();

    QVERIFY(flow.source->isActive());
    QVERIFY(!transition->sourceState());
}

void tst_ChangedWhileRunning::aPopupAddedWhileTheLayerIsActiveIsRequested()
{
    PopupFlow flow(messages());
    flow.start();
    PopupState *popup = flow.popup("late/popup", "Late");

    flow.request("late/popup");

    QVERIFY(popup->isActive());
}

void tst_ChangedWhileRunning::aViewAddedWhileTheMachineRunsIsRequested()
{
    ViewFlow flow;
    flow.start(flow.view(QStringLiteral("Home")));
    flow.view(QStringLiteral("Late"));

    flow.request(QStringLiteral("Late"));

    QCOMPARE(ViewFlow::activeView(), QString("Late"));
}

QTEST_GUILESS_MAIN(tst_ChangedWhileRunning)
#include "tst_changedwhilerunning.moc"
