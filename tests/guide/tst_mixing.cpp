#include "driving.h"
#include "emitter.h"
#include "journal.h"
#include "librarytest.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/hmi/hmiviewtransition.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/keysignaltransition.h>

#include <QEventTransition>
#include <QFinalState>
#include <QHistoryState>
#include <QStateMachine>
#include <QTimerEvent>
#include <QtTest>

#include <type_traits>
#include <utility>

using namespace HmiStateMachine;

namespace {

/** A flow that is half moved: a screen on a bare state, and two views of the library. */
struct Flow
{
    Journal journal;
    RecordingViewStateTarget target{journal};
    Emitter emitter;
    QStateMachine machine;
    QState *const old = new QState(&machine);
    HmiViewState *const home = new HmiViewState("Home", &machine);
    HmiViewState *const radio = new HmiViewState("Radio", &machine);

    Flow() { radio->setHandlesBackEvent(true); }

    void request(const QString &view)
    {
        machine.postEvent(new HmiViewEvent(view, QVariant()));
        settle();
    }
};

// What of QState's ways to add a transition the class has kept.
template <typename State, typename = void> struct TakesMemberPointer : std::false_type
{
};
template <typename State>
struct TakesMemberPointer<State,
                          decltype(void(std::declval<State>().addTransition(
                              std::declval<Emitter *>(), &Emitter::plain,
                              std::declval<QState *>())))> : std::true_type
{
};
template <typename State, typename = void> struct TakesTarget : std::false_type
{
};
template <typename State>
struct TakesTarget<State,
                   decltype(void(std::declval<State>().addTransition(std::declval<QState *>())))>
    : std::true_type
{
};
static_assert(TakesMemberPointer<QState>() && TakesTarget<QState>(), "Qt has both");
static_assert(!TakesMemberPointer<NamedState>() && !TakesTarget<NamedState>(), "do not compile");

} // namespace

/** What docs/from-qstatemachine.md says of Qt's states and transitions among the library's. */
class tst_Mixing : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aBareStateLeadsToAView();
    void aViewLeadsToABareState();
    void aRequestFindsNobodyWhileABareStateIsActive();
    void aBareStateTakesRequestsWithAViewTransition();
    void aBareStateIsNoBackTarget();
    void viewsWorkBelowABareState();
    void bareStatesWorkBelowNamedOnes();
    void propertiesAreAssigned();
    void eventTransitionsAndFinalStatesStay();
};

void tst_Mixing::aBareStateLeadsToAView()
{
    Flow flow;
    flow.old->addTransition(&flow.emitter, SIGNAL(plain()), flow.radio); // QSignalTransition
    startIn(flow.machine, flow.old);

    Q_EMIT flow.emitter.plain();
    settle();

    QCOMPARE(flow.journal.lines(), QStringList("activateView Radio"));
    QCOMPARE(flow.target.viewData("Radio").value("eventData"), QVariant());
}

void tst_Mixing::aViewLeadsToABareState()
{
    Flow flow;
    flow.home->addTransition(&flow.emitter, SIGNAL(plain()), flow.old); // HmiSignalTransition
    startIn(flow.machine, flow.home);

    Q_EMIT flow.emitter.plain();
    settle();

    QCOMPARE(flow.machine.configuration(), QSet<QAbstractState *>({flow.old}));
    QCOMPARE(flow.journal.lines(), QStringList({"activateView Home", "deactivateView Home"}));
}

void tst_Mixing::aRequestFindsNobodyWhileABareStateIsActive()
{
    Flow flow;
    startIn(flow.machine, flow.old);

    flow.request("Radio");

    QCOMPARE(flow.machine.configuration(), QSet<QAbstractState *>({flow.old}));
    QCOMPARE(flow.journal.lines(), QStringList());
}

void tst_Mixing::aBareStateTakesRequestsWithAViewTransition()
{
    Flow flow;
    new HmiViewTransition(flow.old);
    startIn(flow.machine, flow.old);

    flow.request("Radio");

    QCOMPARE(flow.journal.lines(), QStringList("activateView Radio"));
}

void tst_Mixing::aBareStateIsNoBackTarget()
{
    Flow flow;
    new HmiViewTransition(flow.old);
    flow.home->addTransition(&flow.emitter, SIGNAL(plain()), flow.old);
    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();
    settle();

    flow.request("Radio");

    QCOMPARE(flow.radio->backTarget(), QString("Home"));
}

void tst_Mixing::viewsWorkBelowABareState()
{
    Flow flow;
    auto *list = new HmiViewState("List", flow.old);
    auto *details = new HmiViewState("Details", flow.old);
    details->setHandlesBackEvent(true);
    flow.old->setInitialState(list);
    startIn(flow.machine, flow.old);

    flow.request("Details");
    flow.machine.postEvent(new HmiBackEvent(1, QString()));
    settle();

    QCOMPARE(flow.journal.lines(),
             QStringList({"activateView List", "deactivateView List", "activateView Details",
                          "deactivateView Details", "activateView List"}));
}

void tst_Mixing::bareStatesWorkBelowNamedOnes()
{
    Flow flow;
    auto *first = new QState(flow.home);
    auto *second = new QState(flow.home);
    flow.home->setInitialState(first);
    first->addTransition(&flow.emitter, SIGNAL(plain()), second); // below, Qt's own is welcome
    startIn(flow.machine, flow.home);

    Q_EMIT flow.emitter.plain();
    settle();
    QCOMPARE(flow.machine.configuration(), QSet<QAbstractState *>({flow.home, second}));
    auto *history = new QHistoryState(flow.home);
    auto *back = new KeySignalTransition(&flow.emitter, SIGNAL(key(int, int)), 1, 1, flow.radio);
    back->setTargetState(history);
    flow.request("Radio");
    Q_EMIT flow.emitter.key(1, 1);
    settle();

    QCOMPARE(flow.machine.configuration(), QSet<QAbstractState *>({flow.home, second}));
}

void tst_Mixing::propertiesAreAssigned()
{
    Flow flow;
    flow.radio->assignProperty(&flow.emitter, "value", 7);
    startIn(flow.machine, flow.home);

    flow.request("Radio");

    QCOMPARE(flow.emitter.value(), 7);
}

void tst_Mixing::eventTransitionsAndFinalStatesStay()
{
    Flow flow;
    auto *timeout =
        new QEventTransition(&flow.emitter, QEvent::Timer); // Core can copy no other one
    timeout->setTargetState(new QFinalState(&flow.machine));
    flow.home->addTransition(timeout);
    startIn(flow.machine, flow.home);
    QSignalSpy finished(&flow.machine, &QState::finished);
    QVERIFY(finished.isValid());

    QTimerEvent event(1);
    QCoreApplication::sendEvent(&flow.emitter, &event);
    settle();

    QCOMPARE(finished.size(), 1);
}

QTEST_GUILESS_MAIN(tst_Mixing)
#include "tst_mixing.moc"
