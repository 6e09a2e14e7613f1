#include "driving.h"
#include "emitter.h"
#include "librarytest.h"
#include "popupflow.h"
#include "twostates.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/hmi/hmitargetblacklistfilter.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/viewstatetarget.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QPointer>
#include <QTimer>
#include <QtTest>

using namespace HmiStateMachine;

/** What is destroyed while the machine runs, though others still go by it. */
class tst_GoneWhileRunning : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aViewLayerThatIsDestroyedIsCalledNoMore();
    void aViewLayerMayBeReplacedWhileAViewIsActive();
    void theViewLayerMayGoWhilePopupsAreShown();
    void aPopupLivesWithoutItsDismissTransition();
    void aPopupLivesWithoutItsDismissTransition_data();
    void aPopupLivesWithoutItsAutoDismissTransition();
    void aLayerLivesWithoutItsNoPopupState();
    void aPopupOnTheReturnListIsDestroyed();
    void aDestroyedPopupKeepsNobodyFromReturning();
    void aTransitionDestroyedByAGuardOfAnotherStateFiresNoMore();
    void aTransitionDeletedLaterByItsOwnGuardIsTakenOnce();
    void aStateThatIsNotActiveMayGo();
    void anActiveStateMayGoOnceItIsLeft();
    void aFilterOutlivesWhoMadeIt();
    void aViewOnTheBackStackMayGo();
    void aViewThatEnteredLastMayGoAfterIt();
    void aSenderMayGoWhileItsSignalIsDelivered();
};

namespace {

/** A view layer that does nothing and leaves its publishing to the library's base. */
class PlainTarget : public ViewStateTarget
{
public:
    void activateView(const QString &, const QVariant &) override { }
    void deactivateView(const QString &, const QVariant &) override { }
    void preparePopup(const QString &, bool) override { }
    void requestPopupShow(const QString &, int, const QVariant &) override { }
    void requestPopupHide(const QString &, bool) override { }
    void retryBlockedPopup(PopupState *) override { }
    void releaseBlockedPopups(const QMap<PopupState *, QTime> &) override { }
    void updatePopupData(const QString &, const QVariant &) override { }
    void setScreenPopupBehavior(bool) override { }
    void resetScreenPopupBehavior() override { }
    void postFollowOnBackEvent(quint8, const QString &, const QString &) override { }
    int domainFromName(const QString &) override { return 0; }
    int activeDomain() const override { return 0; }
    Identifier activeView() const override { return Identifier(); }
};

} // namespace

void tst_GoneWhileRunning::aViewLayerThatIsDestroyedIsCalledNoMore()
{
    QStateMachine machine;
    auto *home = new HmiViewState(QStringLiteral("Home"), &machine);
    {
        PlainTarget target;
        ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = &target;
        startIn(machine, home);
    }

    QVERIFY2(ViewStateTarget::instance(), "the pointer is the application's own");
    machine.stop();
    settle();
    startIn(machine, home);
    QVERIFY(home->isActive());
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;
}

void tst_GoneWhileRunning::aViewLayerMayBeReplacedWhileAViewIsActive()
{
    ViewFlow flow;
    HmiViewState *home = flow.view(QStringLiteral("Home"));
    home->setReportsQmlViewStatus(true);
    flow.view(QStringLiteral("Radio"))->setReportsQmlViewStatus(true);
    flow.start(home);

    Journal journal;
    RecordingViewStateTarget next(journal);
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = &next;
    flow.request(QStringLiteral("Radio"));

    QCOMPARE(journal.lines(), QStringList({"deactivateView Home", "activateView Radio"}));
    QCOMPARE(flow.take(), QStringList());
}

void tst_GoneWhileRunning::theViewLayerMayGoWhilePopupsAreShown()
{
    QStateMachine machine;
    auto *root = new PopupRootState(QStringLiteral("Layer"), &machine);
    auto *popup = new PopupState(QStringLiteral("call"), root, 1);
    {
        PlainTarget target;
        ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = &target;
        startIn(machine, root);
        machine.postEvent(new PopupEvent(QStringLiteral("call"), QVariant()));
        settle();
    }
    machine.postEvent(new PopupEvent(popup->dismissEventIdentifier(), QVariant()));
    settle();

    QVERIFY(!popup->isActive());
    messages().take();
}

void tst_GoneWhileRunning::aPopupLivesWithoutItsDismissTransition_data()
{
    QTest::addColumn<bool>("shown");
    QTest::newRow("before it is shown") << false;
    QTest::newRow("while it is shown") << true;
}

void tst_GoneWhileRunning::aPopupLivesWithoutItsDismissTransition()
{
    QFETCH(bool, shown);
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("gone/transition", "Gone");
    flow.start();
    if (shown) {
        flow.request("gone/transition");
    }
    delete popup->dismissTransition();

    popup->setPopupViewId("Other");
    if (!shown) {
        flow.request("gone/transition");
    }
    flow.request("gone/transition_Dismiss");

    QCOMPARE(popup->dismissEventIdentifier(), QString());
    QVERIFY(popup->isActive());
    popup->deactivateSource(nullptr);
    popup->activateDismissTransition();
    flow.lower->clearPopups();
    flow.lower->removePopupState(popup);
    settle();
    QVERIFY(!popup->isActive());
    flow.takeMessages();
}

void tst_GoneWhileRunning::aPopupLivesWithoutItsAutoDismissTransition()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("gone/timeout", "Gone");
    popup->setAutoDismissTimeoutActive(true);
    delete popup->autoDismissTransition();

    QVERIFY(!popup->autoDismissTransition());
    flow.upper->addPopupState(popup);
    flow.start();
    flow.request("gone/timeout");
    Q_EMIT flow.target.popupStatusChanged("Gone", true);

    QVERIFY(fire(popup->findChild<QTimer *>()));
    settle();
    QVERIFY(!popup->isActive());
}

void tst_GoneWhileRunning::aLayerLivesWithoutItsNoPopupState()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("gone/none", "Gone");
    flow.start();
    flow.request("gone/none");
    delete flow.lower->noPopupState();

    flow.request("gone/none_Dismiss");
    flow.upperPopup("gone/above", "Above");
    flow.request("gone/above");

    QVERIFY(!flow.lower->noPopupState());
    QVERIFY(popup->isActive());
    QVERIFY(PopupState::isStateActive("Above"));
}

void tst_GoneWhileRunning::aPopupOnTheReturnListIsDestroyed()
{
    PopupFlow flow(messages());
    PopupFlow::rule("gone/first", PopupState::Allow, "gone/second");
    PopupState *first = flow.popup("gone/first", "First");
    PopupState *second = flow.popup("gone/second", "Second");
    flow.start();
    flow.request("gone/first");
    flow.request("gone/second");
    QVERIFY(!flow.lower->wasDeactivated(first));
    delete first;

    flow.request("gone/second_Dismiss");

    QVERIFY(!second->isActive());
    QVERIFY(flow.lower->noPopupState()->isActive());
    QVERIFY(!NamedState::stateForName("gone/first"));
}

void tst_GoneWhileRunning::aDestroyedPopupKeepsNobodyFromReturning()
{
    PopupFlow flow(messages());
    PopupState *first = flow.popup("return/first", "First");
    PopupState *second = flow.popup("return/second", "Second");
    flow.popup("return/third", "Third");
    flow.start();
    flow.request("return/first");
    flow.request("return/second");
    flow.request("return/third");
    delete second;

    flow.request("return/third_Dismiss");

    QVERIFY(first->isActive());
}

void tst_GoneWhileRunning::aTransitionDestroyedByAGuardOfAnotherStateFiresNoMore()
{
    TwoStates flow;
    auto *inner = new NamedState(QStringLiteral("inner"), flow.source);
    flow.source->setInitialState(inner);
    auto *doomed = new HmiTransition(QStringLiteral("go"), flow.source);
    doomed->setTargetState(flow.target);
    auto *guard = new HmiTransition(QStringLiteral("go"), inner);
    connect(guard, &GuardedTransition::transitionTest, this, [guard, &doomed] {
        delete doomed;
        doomed = nullptr;
        guard->setAllowTransition(false);
    });
    flow.start();

    flow.machine.postEvent(new HmiEvent(QStringLiteral("go"), QVariant()));
    settle();

    QVERIFY(!doomed);
    QVERIFY(flow.source->isActive());
}

void tst_GoneWhileRunning::aTransitionDeletedLaterByItsOwnGuardIsTakenOnce()
{
    TwoStates flow;
    const QPointer<HmiTransition> once = new HmiTransition(QStringLiteral("go"), flow.source);
    once->setTargetState(flow.target);
    connect(once, &GuardedTransition::transitionTest, once, &QObject::deleteLater);
    flow.start();

    flow.machine.postEvent(new HmiEvent(QStringLiteral("go"), QVariant()));
    settle();

    QVERIFY(flow.target->isActive());
    QVERIFY(!once);
}

void tst_GoneWhileRunning::aStateThatIsNotActiveMayGo()
{
    TwoStates flow;
    auto *there = new HmiTransition(QStringLiteral("go"), flow.source);
    there->setTargetState(flow.target);
    flow.start();
    delete flow.target;

    flow.machine.postEvent(new HmiEvent(QStringLiteral("go"), QVariant()));
    settle();

    QVERIFY(!there->targetState());
    QVERIFY(flow.source->isActive());
}

void tst_GoneWhileRunning::anActiveStateMayGoOnceItIsLeft()
{
    TwoStates flow;
    auto *leave = new HmiTransition(QStringLiteral("leave"), flow.source);
    leave->setTargetState(flow.target);
    connect(flow.source, &QAbstractState::exited, flow.source, &QObject::deleteLater);
    const QPointer<NamedState> source = flow.source;
    flow.start();

    flow.machine.postEvent(new HmiEvent(QStringLiteral("leave"), QVariant()));
    settle();

    QVERIFY(!source);
    QVERIFY(flow.target->isActive());
    QVERIFY(flow.machine.isRunning());
}

void tst_GoneWhileRunning::aFilterOutlivesWhoMadeIt()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.backView("Radio");
    {
        const auto filter = QSharedPointer<HmiTargetBlacklistFilter>::create("Home");
        radio->addBackTargetFilter(filter);
    }
    flow.start(home);

    flow.request("Radio");

    QCOMPARE(radio->backTarget(), QString());
    QVERIFY(!radio->backTargetValidityTest("Home"));
}

void tst_GoneWhileRunning::aViewOnTheBackStackMayGo()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.backView("Radio");
    flow.backView("Media");
    flow.start(home);
    flow.request("Radio");
    flow.request("Media");
    delete home;

    flow.back();
    flow.back();

    QVERIFY(radio->isActive());
    QCOMPARE(radio->backTarget(), QString());
}

void tst_GoneWhileRunning::aViewThatEnteredLastMayGoAfterIt()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.view("Radio");
    flow.start(radio);
    flow.request("Home");
    delete radio;
    QCOMPARE(HmiViewState::lastKnownViewState(), QString("Radio"));

    flow.request("Radio");

    QVERIFY(home->isActive());
}

void tst_GoneWhileRunning::aSenderMayGoWhileItsSignalIsDelivered()
{
    TwoStates flow;
    const QPointer<Emitter> emitter = new Emitter;
    auto *transition = new HmiSignalTransition(emitter, SIGNAL(plain()), flow.source);
    transition->setTargetState(flow.target);
    connect(transition, &QAbstractTransition::triggered, emitter.data(), [&] { delete emitter; });
    flow.start();

    Q_EMIT emitter->plain();
    settle();

    QVERIFY(!emitter);
    QVERIFY(!transition->senderObject());
    QVERIFY(flow.target->isActive());
}

QTEST_GUILESS_MAIN(tst_GoneWhileRunning)
#include "tst_gonewhilerunning.moc"
