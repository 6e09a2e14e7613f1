#include "driving.h"
#include "emitter.h"
#include "librarytest.h"
#include "popupflow.h"
#include "twostates.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiconditionalstate.h>
#include <HmiStateMachine/hmi/hmidelayedsignaltransition.h>
#include <HmiStateMachine/hmi/hmifallbackviewstate.h>
#include <HmiStateMachine/hmi/hmitargetfilter.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmifallbackevent.h>
#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>
#include <HmiStateMachine/popup/popuptimeoutmonitor.h>

#include <QTimer>
#include <QtTest>

using namespace HmiStateMachine;

/** Values that nobody should give: times below zero, unknown enumerators, odd names, circles. */
class tst_OddValues : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aNegativeTimeoutNeverRuns();
    void aNegativeTickNeverComes();
    void aNegativeDelayIsNone();
    void anUnknownPopupBehaviorTellsNothing();
    void anUnknownInterruptionIsKeptAndLetsTheRequestProceed();
    void aKindThatNobodyKnowsIsHandedOn();
    void theLargestBackDepthIsAnOrdinaryOne();
    void anEmptyNameRequestsNoView();
    void anEmptyNameRequestsAPopupWithoutAName();
    void aStateMayBeRenamedWhileItIsActive();
    void aRenamedBackTargetIsKeptWhileItIsSet();
    void aRenamedViewOnABackStackIsNotFound();
    void aBackStackTakesANameWithEachStepForward();
    void aRenamedActivePopupComesBackOnce();
    void oneTransitionMayJoinTwoGroups();
    void aPopupWithoutALayerAmongViewsIsAPlainState();
    void twoLayersMayNotShareAPopupName();
    void aCircleOfDecisionsTurnsUntilAGuardRefuses();
    void aCircleOfRefusedBackTargetsIsWalkedUntilAFilterAccepts();
    void aCircleOfFallbacksTurnsUntilAViewIsPermitted();
};

namespace {

constexpr char negativeTimer[] = "QObject::startTimer: Timers cannot have negative intervals";

/** Refuses every target until it was asked often enough. */
class RefusesAtFirst : public HmiTargetFilter
{
public:
    explicit RefusesAtFirst(int refusals) : m_left(refusals) { }

    bool isValid(const QString &) const override { return m_left-- <= 0; }

private:
    mutable int m_left;
};

/** Is forbidden until it was asked often enough. */
class LatePermitted : public HmiFallbackViewState
{
public:
    LatePermitted(const QString &name, const QString &other, QState *parent)
        : HmiFallbackViewState(name, QString(), parent), m_other(other)
    {
    }

    bool permitted() override { return refusalsLeft-- <= 0; }
    QString fallbackTarget() override { return m_other; }

    static int refusalsLeft;

private:
    QString m_other;
};

int LatePermitted::refusalsLeft = 0;

} // namespace

void tst_OddValues::aNegativeTimeoutNeverRuns()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("odd/timeout", "Timeout");
    popup->setAutoDismissTimeoutInterval(-1);
    popup->setAutoDismissTimeoutActive(true);
    flow.start();
    flow.request("odd/timeout");
    QTest::ignoreMessage(QtWarningMsg, negativeTimer);

    Q_EMIT flow.target.popupStatusChanged("Timeout", true);

    QCOMPARE(popup->findChild<QTimer *>()->timerId(), 0); // no timer of the event loop's
    QCOMPARE(popup->autoDismissRemainingTime(), 0);
    QVERIFY(popup->isActive());
}

void tst_OddValues::aNegativeTickNeverComes()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("odd/tick", "Tick");
    popup->setAutoDismissTimeoutActive(true);
    const PopupTimeoutMonitor *monitor = new PopupTimeoutMonitor(-5, popup);
    flow.start();
    QTest::ignoreMessage(QtWarningMsg, negativeTimer);

    flow.request("odd/tick");

    QCOMPARE(monitor->findChild<QTimer *>()->timerId(), 0); // no timer of the event loop's
}

void tst_OddValues::aNegativeDelayIsNone()
{
    Emitter emitter;
    TwoStates flow;
    const HmiDelayedSignalTransition *transition =
        new HmiDelayedSignalTransition(&emitter, SIGNAL(plain()), -20, flow.source);

    QCOMPARE(transition->findChild<QTimer *>()->interval(), 0);
}

void tst_OddValues::anUnknownPopupBehaviorTellsNothing()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    home->setPopupBehavior(static_cast<HmiState::PopupBehavior>(7));
    flow.target.recordPopupBehavior(true);
    flow.machine.setInitialState(home);
    flow.machine.start();
    settle();

    QCOMPARE(int(home->popupBehavior()), 7);
    QCOMPARE(flow.take(), QStringList("activateView Home"));
}

void tst_OddValues::anUnknownInterruptionIsKeptAndLetsTheRequestProceed()
{
    PopupFlow flow(messages());
    PopupFlow::rule("odd/front", static_cast<PopupState::InterruptionBehavior>(9), "odd/asked");
    flow.popup("odd/front", "Front");
    PopupState *asked = flow.popup("odd/asked", "Asked");
    flow.start();
    flow.request("odd/front");

    flow.request("odd/asked");

    QVERIFY(asked->isActive());
}

void tst_OddValues::aKindThatNobodyKnowsIsHandedOn()
{
    PopupFlow flow(messages());
    flow.popup("odd/kind", "Kind", -3);
    flow.start();

    flow.request("odd/kind");

    QVERIFY(flow.take().contains("requestPopupShow Kind -3"));
}

void tst_OddValues::theLargestBackDepthIsAnOrdinaryOne()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    flow.backView("Radio");
    flow.start(home);
    flow.target.followBackRequests(&flow.machine);
    flow.request("Radio");

    flow.back(255);

    QCOMPARE(ViewFlow::activeView(), QString("Home"));
}

void tst_OddValues::anEmptyNameRequestsNoView()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    flow.view(QString());
    flow.start(home);

    flow.request(QString());

    QVERIFY(home->isActive());
}

void tst_OddValues::anEmptyNameRequestsAPopupWithoutAName()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup(QString(), "Nameless");
    flow.start();

    flow.request(QString());

    QVERIFY(popup->isActive());
    QVERIFY(!flow.takeMessages().isEmpty());
}

void tst_OddValues::aStateMayBeRenamedWhileItIsActive()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    flow.view("Radio");
    flow.start(home);

    home->setName("Start");
    flow.request("Radio");
    flow.request("Start");

    QVERIFY(home->isActive());
    QVERIFY(!NamedState::stateForName("Home"));
}

void tst_OddValues::aRenamedBackTargetIsKeptWhileItIsSet()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.backView("Radio");
    flow.start(home);
    flow.request("Radio");

    home->setName("Start");

    QCOMPARE(radio->backTarget(), QString("Start"));
    flow.back();
    QVERIFY(home->isActive());
}

void tst_OddValues::aRenamedViewOnABackStackIsNotFound()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.backView("Radio");
    flow.backView("Media");
    flow.start(home);
    flow.request("Radio");
    flow.request("Media");
    home->setName("Start");

    flow.back();

    QVERIFY(radio->isActive());
    QCOMPARE(radio->backTarget(), QString());
}

// There is no limit: an application that goes on and on has to empty it.
void tst_OddValues::aBackStackTakesANameWithEachStepForward()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.backView("Radio");
    flow.start(home);
    for (int i = 0; i < 1000; ++i) {
        flow.request("Radio");
        flow.request("Home");
    }

    int names = 0;
    while (!radio->popBackStack().isEmpty()) {
        ++names;
    }

    QCOMPARE(names, 1000);
}

// Its layer knows it by the name that it had, and takes that for a popup which waits.
void tst_OddValues::aRenamedActivePopupComesBackOnce()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("odd/old", "Popup");
    flow.start();
    flow.request("odd/old");

    popup->setName("odd/new");
    flow.request("odd/old_Dismiss");
    QVERIFY(popup->isActive());
    flow.request("odd/new_Dismiss");
    QVERIFY(popup->isActive());
    flow.request("odd/new_Dismiss");

    QVERIFY(!popup->isActive());
}

void tst_OddValues::oneTransitionMayJoinTwoGroups()
{
    TwoStates flow;
    auto *transition = new GuardedTransition(flow.source);
    ParallelSiblingTransitionGroup first(nullptr);
    ParallelSiblingTransitionGroup second(nullptr);

    QVERIFY(first.addTransition(transition, 1));
    QVERIFY(second.addTransition(transition, 7));
    QVERIFY(!first.addTransition(transition, 2));
}

void tst_OddValues::aPopupWithoutALayerAmongViewsIsAPlainState()
{
    TwoStates flow;
    auto *popup = new PopupState("odd/alone", 1);
    popup->setParent(flow.source);
    flow.source->setInitialState(popup);

    flow.start();

    QVERIFY(popup->isActive());
    QVERIFY(!popup->rootPopupState());
    flow.machine.postEvent(new QEvent(QEvent::User));
    settle();
    QVERIFY(!messages().take().isEmpty());
}

void tst_OddValues::twoLayersMayNotShareAPopupName()
{
    PopupFlow flow(messages());
    PopupState *lower = flow.popup("odd/twice", "Lower");
    PopupState *upper = flow.upperPopup("odd/twice", "Upper");
    flow.start();

    flow.request("odd/twice");

    QVERIFY(lower->isActive());
    QVERIFY(!upper->isActive());
    QCOMPARE(upper->name(), QString());
    QCOMPARE(flow.takeMessages().size(), 1);
}

// Qt enters the two in turn for ever. Nothing tells a circle from a long way.
void tst_OddValues::aCircleOfDecisionsTurnsUntilAGuardRefuses()
{
    QStateMachine machine;
    auto *first = new HmiConditionalState("First", &machine);
    auto *second = new HmiConditionalState("Second", &machine);
    first->setTargetState(second);
    second->setTargetState(first);
    int tests = 0;
    auto *guard = second->findChild<GuardedTransition *>();
    connect(second, &HmiConditionalState::conditionTest, guard,
            [guard, &tests] { guard->setAllowTransition(++tests < 1000); });

    startIn(machine, first);

    QCOMPARE(tests, 1000);
    QVERIFY(second->isActive());
}

void tst_OddValues::aCircleOfRefusedBackTargetsIsWalkedUntilAFilterAccepts()
{
    ViewFlow flow;
    HmiViewState *home = flow.backView("Home");
    flow.backView("Radio");
    HmiViewState *media = flow.backView("Media");
    media->addBackTargetFilter(QSharedPointer<RefusesAtFirst>::create(1000));
    flow.start(home);
    flow.request("Radio");
    flow.request("Home");

    flow.request("Media");

    QCOMPARE(media->backTarget(), QString("Home"));
}

void tst_OddValues::aCircleOfFallbacksTurnsUntilAViewIsPermitted()
{
    StateMachine *machine = StateMachine::instance();
    auto *first = new LatePermitted("First", "Second", machine);
    auto *second = new LatePermitted("Second", "First", machine);
    LatePermitted::refusalsLeft = 1000;
    startIn(*machine, first);

    QCOMPARE(LatePermitted::refusalsLeft, -1);
    QVERIFY(first->isActive() || second->isActive());
    park(*machine);
    delete first;
    delete second;
}

QTEST_GUILESS_MAIN(tst_OddValues)
#include "tst_oddvalues.moc"
