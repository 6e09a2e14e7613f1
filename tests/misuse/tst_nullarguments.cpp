#include "driving.h"
#include "librarytest.h"
#include "twostates.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiconditionalstate.h>
#include <HmiStateMachine/hmi/hmidelayedsignaltransition.h>
#include <HmiStateMachine/hmi/hmifallbackviewstate.h>
#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmipropertyboundfallbackviewstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedpropertychangetransition.h>
#include <HmiStateMachine/named/intsignaltransition.h>
#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/domainblockedpopupstate.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popuptimeoutmonitor.h>
#include <HmiStateMachine/popup/popuptransition.h>

#include <QTimer>
#include <QtTest>

using namespace HmiStateMachine;

class tst_NullArguments : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void statesLiveWithoutAParent();
    void transitionsLiveWithoutASource();
    void noStateIsNoInfotainmentState();
    void noTransitionIsAddedOrRemoved();
    void aKeyOfNoSignalIsBlockedWithoutEffect();
    void aDelayedTransitionWithoutASenderNeverFires();
    void aPropertyWithoutANameIsMissing();
    void aBoundViewWithoutAPropertyNameIsNeverPermitted();
    void noStateIsABackTarget();
    void theStoreAllowsForNoPopup();
    void theStoreBlocksNoPopup();
    void aRefusalOfNoPopupIsIgnored();
    void aPopupIsNotStackedByNothing();
    void noPopupIsActiveOrASibling();
    void aMonitorWithoutAPopupTicksForNobody();
    void stackedPopupsBlockNoPopup();
    void noEventDismissesNothing();
};

void tst_NullArguments::statesLiveWithoutAParent()
{
    const NamedState named(QStringLiteral("named"), nullptr);
    const HmiState hmi(QStringLiteral("hmi"), nullptr);
    const HmiViewState view(QStringLiteral("view"), nullptr);
    const HmiFallbackViewState fallback(QStringLiteral("fallback"), QStringLiteral("nowhere"),
                                        nullptr);
    const HmiLayeredState layered(QStringLiteral("layered"), nullptr);
    const HmiConditionalState decision(QStringLiteral("decision"), static_cast<QState *>(nullptr));
    const PopupRootState root(QStringLiteral("root"), nullptr);

    QVERIFY(!named.parentState() && !hmi.parentState() && !view.parentState());
    QVERIFY(!fallback.parentState() && !layered.parentState());
    QVERIFY(!decision.parentState() && !root.parentState());
}

void tst_NullArguments::transitionsLiveWithoutASource()
{
    QObject sender;
    HmiDelayedSignalTransition delayed(&sender, SIGNAL(objectNameChanged(QString)), 10, nullptr);
    IntSignalTransition number(&sender, SIGNAL(objectNameChanged(QString)), 1, nullptr);
    KeySignalTransition key(&sender, SIGNAL(objectNameChanged(QString)), 1, 1, nullptr);
    GuardedPropertyChangeTransition property(&sender, "objectName", {}, QVariant(), nullptr);

    sender.setObjectName(QStringLiteral("changed"));

    for (QAbstractTransition *transition :
         QList<QAbstractTransition *>{&delayed, &number, &key, &property}) {
        QVERIFY(!transition->sourceState());
    }
    QVERIFY(key.makeParallelExclusive(1));
}

void tst_NullArguments::noStateIsNoInfotainmentState()
{
    StateMachine machine;
    QTest::ignoreMessage(QtWarningMsg,
                         "QObject::connect(QAbstractState, HmiStateMachine::StateMachine): "
                         "invalid nullptr parameter");
    QTest::ignoreMessage(QtWarningMsg,
                         "QObject::connect(QAbstractState, HmiStateMachine::StateMachine): "
                         "invalid nullptr parameter");

    machine.setInfotainmentState(nullptr);

    QVERIFY(!machine.infotainmentStateActive());
}

void tst_NullArguments::noTransitionIsAddedOrRemoved()
{
    TwoStates flow;
    QTest::ignoreMessage(QtWarningMsg, "QState::addTransition: cannot add null transition");
    QTest::ignoreMessage(QtWarningMsg, "QState::removeTransition: cannot remove null transition");

    flow.source->addTransition(static_cast<QAbstractTransition *>(nullptr));
    flow.source->removeTransition(nullptr);

    QCOMPARE(flow.source->transitions().size(), 0);
}

void tst_NullArguments::aKeyOfNoSignalIsBlockedWithoutEffect()
{
    TwoStates flow;

    flow.source->blockKey(1, 1, nullptr, nullptr);
    flow.start();

    QVERIFY(flow.source->isActive());
    QCOMPARE(KeySignalTransition::keySignalTransitions(nullptr, nullptr, 1, 1).size(), 0);
}

void tst_NullArguments::aDelayedTransitionWithoutASenderNeverFires()
{
    TwoStates flow;
    QTest::ignoreMessage(QtWarningMsg,
                         "QObject::connect: Cannot connect (nullptr)::(nullptr) to "
                         "HmiStateMachine::HmiDelayedSignalTransition"
                         "::signalReceived()");
    auto *transition = new HmiDelayedSignalTransition(nullptr, nullptr, 10, flow.source);
    transition->setTargetState(flow.target);
    flow.start();

    QVERIFY(fire(transition->findChild<QTimer *>()));
    settle();

    QVERIFY(flow.source->isActive());
}

void tst_NullArguments::aPropertyWithoutANameIsMissing()
{
    TwoStates flow;
    QObject sender;

    new GuardedPropertyChangeTransition(&sender, nullptr, {}, QVariant(), flow.source);

    const QStringList written = messages().take();
    QCOMPARE(written.size(), 1);
    QVERIFY(written.first().startsWith("warning GuardedPropertyChangeTransition: The sender object "
                                       "does not contain the following property:"));
}

void tst_NullArguments::aBoundViewWithoutAPropertyNameIsNeverPermitted()
{
    ViewFlow flow;
    QObject object;
    auto *bound =
        new HmiPropertyBoundFallbackViewState(QStringLiteral("Bound"), QStringLiteral("Home"),
                                              &object, nullptr, {1}, &flow.machine, true);

    // The process-wide machine is asked to fall back, which does not run here.
    QTest::ignoreMessage(QtWarningMsg,
                         "QStateMachine::postEvent: cannot post event when the state "
                         "machine is not running");
    flow.start(bound);

    QVERIFY(bound->isActive());
    QVERIFY(!flow.take().contains(QStringLiteral("activateView Bound")));
}

void tst_NullArguments::noStateIsABackTarget()
{
    ViewFlow flow;
    HmiViewState *view = flow.backView(QStringLiteral("Radio"));
    view->setBackTargetProviderState(nullptr);
    view->addBackTargetFilter(QSharedPointer<HmiTargetFilter>());
    view->registerMonitoringState(nullptr);
    view->unregisterMonitoringState(nullptr);

    view->createDirectBackTransition(nullptr);
    flow.start(view);
    flow.back();

    QVERIFY(!view->directBackTransitionTarget());
    QVERIFY(!view->handlesBackEvent());
    QVERIFY(view->isActive());
}

void tst_NullArguments::theStoreAllowsForNoPopup()
{
    const PopupState popup(QStringLiteral("asked"), 1);
    const PopupState *none = nullptr;
    const PopupInterruptionStore store;

    QCOMPARE(store.getInterruptionBehavior(none, &popup), PopupState::Allow);
    QCOMPARE(store.getInterruptionBehavior(&popup, none), PopupState::Allow);
    QCOMPARE(store.getInterruptionBehavior(none, none), PopupState::Allow);
}

void tst_NullArguments::theStoreBlocksNoPopup()
{
    const PopupState *none = nullptr;
    const PopupInterruptionStore store;

    QVERIFY(!store.isBlockedByDomain(none));
    QVERIFY(!store.isBlockedByDomain(none, 1));
    QVERIFY(!store.isBlockedByView(none));
    QVERIFY(!store.isBlockedByView(none, QStringLiteral("Home")));
}

void tst_NullArguments::aRefusalOfNoPopupIsIgnored()
{
    PopupState::setStoreBlockedPopups(true);

    PopupState::popupBlocked(nullptr);

    Journal journal;
    RecordingViewStateTarget target(journal);
    PopupState::setStoreBlockedPopups(false);
    QCOMPARE(journal.lines(), QStringList("releaseBlockedPopups 0"));
}

void tst_NullArguments::aPopupIsNotStackedByNothing()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    PopupState popup(QStringLiteral("popup"), 1);

    popup.stack(nullptr);

    QVERIFY(!popup.stackedBySibling());
    QCOMPARE(journal.lines(), QStringList());
}

void tst_NullArguments::noPopupIsActiveOrASibling()
{
    PopupRootState root(QStringLiteral("root"), nullptr);
    auto *popup = new PopupState(QStringLiteral("popup"), &root, 1);

    QVERIFY(!PopupState::isStateActive(static_cast<PopupState *>(nullptr)));
    QVERIFY(!popup->isSibling(nullptr));
    QVERIFY(!root.isActivePopupState(nullptr));
    QVERIFY(root.wasDeactivated(nullptr));
}

void tst_NullArguments::aMonitorWithoutAPopupTicksForNobody()
{
    PopupTimeoutMonitor monitor(100, nullptr);

    monitor.startMonitoring();
    monitor.setTimerTick(50);

    QCOMPARE(monitor.timeRemaining(), 0);
    QVERIFY(!monitor.findChild<QTimer *>()->isActive());
}

void tst_NullArguments::stackedPopupsBlockNoPopup()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    target.stackPopup(QStringLiteral("behind"), QStringLiteral("front"));
    PopupTransition transition;

    QVERIFY(!transition.blockedByStacked(nullptr));
}

void tst_NullArguments::noEventDismissesNothing()
{
    PopupState popup(QStringLiteral("popup"), 1);

    QVERIFY(!popup.dismissTransition()->isDismissEvent(nullptr));
    popup.updateEventData(nullptr);
}

QTEST_GUILESS_MAIN(tst_NullArguments)
#include "tst_nullarguments.moc"
