#include "childprocess.h"
#include "driving.h"
#include "emitter.h"
#include "journal.h"
#include "librarytest.h"
#include "metadescription.h"

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/named/namedstate.h>

#include <QEventTransition>
#include <QFinalState>
#include <QRegularExpression>
#include <QSemaphore>
#include <QStateMachine>
#include <QThread>
#include <QtTest>

#include <atomic>
#include <cstdio>
#include <functional>
#include <memory>
#include <vector>

using namespace HmiStateMachine;

namespace {

// Writes down what it is told, and then does what the test wants done at that moment.
class Monitor : public NamedState
{
    Q_OBJECT

public:
    Monitor(const QString &name, Journal &journal, QState *parent = nullptr)
        : NamedState(name, parent), m_journal(journal)
    {
    }

    void monitoredStateEntered(QEvent *e) override { note("entered", e); }
    void monitoredStateExited(QEvent *e) override { note("exited", e); }

    std::function<void()> reaction;

private:
    void note(const QString &what, QEvent *e)
    {
        m_journal.add(name() + ' ' + what + ' ' + QString::number(e->type()));
        if (const auto react = reaction) {
            react();
        }
    }

    Journal &m_journal;
};

// A subclass that chooses among its children itself.
class ChoosingState : public NamedState
{
    Q_OBJECT

public:
    using NamedState::NamedState;

    void setInitialState(QState *state) override
    {
        requested = state;
        NamedState::setInitialState(choice);
    }

    QState *initialState() const override { return requested; }

    QState *requested = nullptr;
    QState *choice = nullptr;
};

class DerivedRawTransition : public QSignalTransition
{
    Q_OBJECT

public:
    using QSignalTransition::QSignalTransition;
};

// Without a meta-object of its own.
class PlainDerivedRawTransition : public QSignalTransition
{
public:
    using QSignalTransition::QSignalTransition;
};

class DerivedTransition : public HmiSignalTransition
{
    Q_OBJECT

public:
    using HmiSignalTransition::HmiSignalTransition;
};

class PlainDerivedTransition : public HmiSignalTransition
{
public:
    using HmiSignalTransition::HmiSignalTransition;
};

// Two screens that an emitter changes between, the second one watched by the test.
struct Flow
{
    Flow()
    {
        home->addTransition(&emitter, SIGNAL(plain()), away);
        away->addTransition(&emitter, SIGNAL(plain()), home);
    }

    Emitter emitter;
    Journal journal;
    QStateMachine machine;
    NamedState *home = new NamedState("Home", &machine);
    NamedState *away = new NamedState("Away", &machine);
};

// A region of screens that changes on a key, beside a region in which a state may block it.
struct KeyFlow
{
    explicit KeyFlow(int key)
    {
        screens->setInitialState(first);
        guards->setInitialState(open);
        open->addTransition(&emitter, SIGNAL(plain()), closed);
        closed->addTransition(&emitter, SIGNAL(plain()), open);
        transition = new KeySignalTransition(&emitter, SIGNAL(key(int, int)), key, 0, first);
        transition->setTargetState(second);
    }

    // The lowest positive priority that no transition for this key and status has.
    int firstFreePriority(int key, int status)
    {
        KeySignalTransition probe(&emitter, SIGNAL(key(int, int)), key, status, second);
        int priority = 1;
        while (!probe.makeParallelExclusive(priority)) {
            ++priority;
        }
        return priority;
    }

    Emitter emitter;
    QStateMachine machine;
    NamedState *both = new NamedState("Both", QState::ParallelStates, &machine);
    NamedState *screens = new NamedState("Screens", both);
    NamedState *first = new NamedState("First", screens);
    NamedState *second = new NamedState("Second", screens);
    NamedState *guards = new NamedState("Guards", both);
    NamedState *open = new NamedState("Open", guards);
    NamedState *closed = new NamedState("Closed", guards);
    KeySignalTransition *transition = nullptr;
};

QString address(const QObject *object)
{
    return "0x" + QString::number(reinterpret_cast<quintptr>(object), 16);
}

QStringList registeredNames()
{
    QStringList names;
    const auto states = NamedState::namedStates();
    for (const NamedState *state : states) {
        names.append(state->name());
    }
    names.sort();
    return names;
}

// Runs a function in several threads at once, with the number of each.
void runTogether(int count, const std::function<void(int)> &function)
{
    QSemaphore gate;
    std::vector<std::unique_ptr<QThread>> threads;
    for (int number = 0; number < count; ++number) {
        threads.emplace_back(QThread::create([&gate, &function, number] {
            gate.acquire();
            function(number);
        }));
        threads.back()->start();
    }

    gate.release(count);
    for (const auto &thread : threads) {
        QVERIFY(thread->wait());
    }
}

void printWithContext(QtMsgType type, const QMessageLogContext &context, const QString &text)
{
    if (type == QtFatalMsg) {
        std::fprintf(stderr, "<%s|%s|%s|%d> %s\n", context.category, context.function, context.file,
                     context.line, qPrintable(text));
    }
}

// Ways in which a plain signal transition gets to a named state that is active in a machine.

void addRaw(Flow &flow)
{
    flow.away->addTransition(new QSignalTransition(&flow.emitter, SIGNAL(other())));
}

void addDerivedRaw(Flow &flow)
{
    flow.away->addTransition(new DerivedRawTransition(&flow.emitter, SIGNAL(other())));
}

void reparentRaw(Flow &flow)
{
    QSignalTransition transition(&flow.emitter, SIGNAL(other()));
    transition.setParent(flow.away);
}

void constructRawUntilTheLoopRuns(Flow &flow)
{
    new QSignalTransition(&flow.emitter, SIGNAL(other()), flow.away);
    settle();
}

void constructRawUntilTheStateIsEntered(Flow &flow)
{
    new QSignalTransition(&flow.emitter, SIGNAL(other()), flow.away);
    Q_EMIT flow.emitter.plain();
}

void constructRawInAnActiveState(Flow &flow)
{
    new QSignalTransition(&flow.emitter, SIGNAL(other()), flow.home);
    settle();
}

void constructRawBesideAProperOne(Flow &flow)
{
    new HmiSignalTransition(&flow.emitter, SIGNAL(other()), flow.away);
    new QSignalTransition(&flow.emitter, SIGNAL(other()), flow.away);
    settle();
}

void constructRawAfterAnEarlierCheck(Flow &flow)
{
    new HmiSignalTransition(&flow.emitter, SIGNAL(other()), flow.away);
    settle();
    new QSignalTransition(&flow.emitter, SIGNAL(other()), flow.away);
    settle();
}

void constructRawAndAdd(Flow &flow)
{
    auto *transition = new QSignalTransition(&flow.emitter, SIGNAL(other()), flow.away);
    flow.away->addTransition(transition);
}

void reparentDerivedRaw(Flow &flow)
{
    DerivedRawTransition transition(&flow.emitter, SIGNAL(other()));
    transition.setParent(flow.away);
}

void constructDerivedRaw(Flow &flow)
{
    new DerivedRawTransition(&flow.emitter, SIGNAL(other()), flow.away);
    settle();
}

void addPlainDerivedRaw(Flow &flow)
{
    flow.away->addTransition(new PlainDerivedRawTransition(&flow.emitter, SIGNAL(other())));
}

void constructPlainDerivedRaw(Flow &flow)
{
    new PlainDerivedRawTransition(&flow.emitter, SIGNAL(other()), flow.away);
    settle();
}

// A view state has transitions of its own, which it is not asked to look at.

void constructRawInAViewState(Flow &flow)
{
    auto *view = new HmiViewState("View", &flow.machine);
    new QSignalTransition(&flow.emitter, SIGNAL(other()), view);
    settle();
}

void addRawToAViewState(Flow &flow)
{
    auto *view = new HmiViewState("View", &flow.machine);
    view->addTransition(new QSignalTransition(&flow.emitter, SIGNAL(other())));
}

void reparentRawToAViewState(Flow &flow)
{
    auto *view = new HmiViewState("View", &flow.machine);
    QSignalTransition transition(&flow.emitter, SIGNAL(other()));
    transition.setParent(view);
}

void constructRawInAViewStateThatGoesBack(Flow &flow)
{
    auto *view = new HmiViewState("View", &flow.machine);
    view->setHandlesBackEvent(true);
    new QSignalTransition(&flow.emitter, SIGNAL(other()), view);
    settle();
}

void constructRawInAViewStateThatGoesBackNoMore(Flow &flow)
{
    auto *view = new HmiViewState("View", &flow.machine);
    view->setHandlesBackEvent(true);
    settle();
    view->setHandlesBackEvent(false);
    new QSignalTransition(&flow.emitter, SIGNAL(other()), view);
    settle();
}

void constructRawInAViewStateUntilItIsEntered(Flow &flow)
{
    auto *view = new HmiViewState("View", &flow.machine);
    view->setHandlesBackEvent(true);
    flow.home->addTransition(&flow.emitter, SIGNAL(withInt(int)), view);
    new QSignalTransition(&flow.emitter, SIGNAL(other()), view);
    Q_EMIT flow.emitter.withInt(1);
}

void testRaw(Flow &flow)
{
    QSignalTransition transition(&flow.emitter, SIGNAL(other()));
    flow.away->transitionTypeTest(&transition);
}

} // namespace

using Misuse = void (*)(Flow &);
Q_DECLARE_METATYPE(Misuse)

class tst_NamedState : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();

    void everyConstructorRegistersItsName();
    void aStateWithoutANameIsNotRegistered();
    void everyRegisteredStateIsListed();
    void anUnknownNameFindsNothing_data();
    void anUnknownNameFindsNothing();
    void theSecondStateOfANameIsLeftWithoutOne();
    void aCollisionIsReportedWithBothStates();
    void aCollisionLeavesTheStateOfAnotherThreadAlone();
    void aCollisionIsSilentWhileWarningsAreOff();
    void theLosersEndLeavesTheWinnersName();
    void aDestroyedStateFreesItsName();
    void anEmptyNameIsNotRegistered();
    void aNameIsRegisteredOnce();
    void aStateCanBeFoundUnderASecondName();
    void aNameIsFreedWhicheverStateHoldsIt_data();
    void aNameIsFreedWhicheverStateHoldsIt();
    void theRegistryIsSharedByThreads();
    void oneOfSeveralThreadsGetsAName();

    void renamingMovesTheEntry();
    void renamingToTheSameNameChangesNothing_data();
    void renamingToTheSameNameChangesNothing();
    void renamingToATakenNameLosesTheOwn();
    void aStateThatLostItsNameCanTakeAnother();
    void anEmptyNameUnregistersTheState();
    void theNameIsChangedBeforeItIsAnnounced();
    void theNameIsAProperty();
    void theNameReachesQueuedListeners();
    void aNameCanBeCarriedWithoutTheRegistry();
    void sharingAnothersNameLeavesItsEntry();
    void aNamesakesEndFreesTheEntryOfTheOther();

    void aStateIsActiveFromEntryToExit();
    void aStateIsActiveBeforeItsMonitorsAreTold();
    void monitorsAreToldInOrderWithTheEvent();
    void aMonitorIsRegisteredOnce();
    void anUnregisteredMonitorIsNotTold();
    void noMonitorIsIgnored();
    void aStateMayMonitorItself();
    void aPlainStateMonitorsWithoutEffect();
    void monitorsAreToldAlsoWithoutLogging();
    void aMonitorMayUnregisterItselfWhileTold();
    void aMonitorUnregisteredByAnotherIsToldForTheLastTime();
    void aMonitorRegisteredByAnotherIsToldTheNextTime();
    void aMonitorMayDeleteItselfWhileTold();
    void aMonitorDeletedByAnotherIsNotTold();
    void aMonitorDeletedByAnotherDoesNotHearOfTheExit();
    void aMonitorDestroyedBeforehandIsNotTold();
    void aMonitorOutlivesTheMonitoredState();
    void aMonitorMayBeDestroyedAtTheEndOfTheMonitoredState();

    void loggingIsOffAtFirst();
    void loggingIsSwitchedForAllStates();
    void nothingIsLoggedWhileLoggingIsOff();
    void nothingIsLoggedWhileDebugOutputIsOff();
    void aPathBeginsAtTheMachine();
    void exitsAreLoggedInnermostFirst();
    void aPathNamesEachKindOfAncestor_data();
    void aPathNamesEachKindOfAncestor();
    void logMessagesCarryTheirPlaceInTheSource();
    void monitorsAreToldBeforeTheEntryIsLogged();

    void aRawSignalTransitionEndsTheProcess_data();
    void aRawSignalTransitionEndsTheProcess();
    void otherChildrenAreWelcome();
    void derivedTransitionsAreWelcome();
    void aRawTransitionThatIsGoneInTimeDoesNoHarm();
    void nothingIsNoRawTransition();

    void aSignalTransitionIsTheLibrarysOwn();
    void aSignalTransitionLeadsToItsTarget();
    void aSignalTransitionWithoutATargetStays();
    void aSignalTransitionWithoutASenderNeverFires();
    void anUnknownSignalIsReportedAndTheMachineRuns();
    void aDestroyedSenderNeverFires();

    void aBlockedKeyIsSwallowedWhileTheStateIsActive();
    void anotherKeyOrStatusIsNotBlocked_data();
    void anotherKeyOrStatusIsNotBlocked();
    void theBlockerIsAnUnpublishedTransitionWithoutATarget();
    void anActiveStateBlocksFromItsNextEntry();
    void aTransitionPublishedLaterIsNotBlocked();
    void publishedTransitionsAreNumberedLatestFirst();
    void aTransitionKeepsItsFirstPriority();
    void everyBlockerTakesTheNextFreePriority();
    void aKeyCanBeBlockedBeforeAnyTransitionReactsToIt();
    void aKeyOfNoSenderCanBeBlocked();

    void theInitialStateIsTheBases();
    void aSubclassTakesOverTheChoiceOfTheInitialState();
    void aStateThatIsNoChildIsNoInitialState();
};

void tst_NamedState::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(NamedState::staticMetaObject),
             QStringList({"signal nameChanged(Identifier name)", "slot setName(Identifier name)",
                          "property Identifier name read write nameChanged(Identifier)"}));
    QCOMPARE(NamedState::staticMetaObject.superClass(), &QState::staticMetaObject);
}

void tst_NamedState::everyConstructorRegistersItsName()
{
    QState parent;
    NamedState named("Named", &parent);
    NamedState parallel("Parallel", QState::ParallelStates, &parent);

    QCOMPARE(NamedState::stateForName("Named"), &named);
    QCOMPARE(named.name(), QString("Named"));
    QCOMPARE(named.objectName(), QString("Named"));
    QCOMPARE(named.parentState(), &parent);
    QCOMPARE(named.childMode(), QState::ExclusiveStates);
    QCOMPARE(NamedState::stateForName("Parallel"), &parallel);
    QCOMPARE(parallel.objectName(), QString("Parallel"));
    QCOMPARE(parallel.parentState(), &parent);
    QCOMPARE(parallel.childMode(), QState::ParallelStates);
}

void tst_NamedState::aStateWithoutANameIsNotRegistered()
{
    QState parent;
    NamedState plain(&parent);
    NamedState parallel(QState::ParallelStates, &parent);
    NamedState empty(QString(), &parent);

    QCOMPARE(NamedState::namedStates(), QList<NamedState *>());
    QCOMPARE(plain.name(), QString());
    QCOMPARE(plain.objectName(), QString());
    QCOMPARE(plain.parentState(), &parent);
    QCOMPARE(plain.isActive(), false);
    QCOMPARE(parallel.name(), QString());
    QCOMPARE(parallel.parentState(), &parent);
    QCOMPARE(parallel.childMode(), QState::ParallelStates);
    QCOMPARE(empty.name(), QString());
}

void tst_NamedState::everyRegisteredStateIsListed()
{
    NamedState radio("Radio");
    NamedState unnamed;
    NamedState map("Map");
    NamedState carried;
    carried.setNameNonHashing("Carried");

    QCOMPARE(registeredNames(), QStringList({"Map", "Radio"}));
}

void tst_NamedState::anUnknownNameFindsNothing_data()
{
    QTest::addColumn<QString>("name");

    QTest::newRow("unknown") << "Nowhere";
    QTest::newRow("of another case") << "radio";
    QTest::newRow("with a blank") << "Radio ";
    QTest::newRow("empty") << "";
    QTest::newRow("null") << QString();
}

void tst_NamedState::anUnknownNameFindsNothing()
{
    QFETCH(QString, name);
    NamedState radio("Radio");
    NamedState unnamed;

    QCOMPARE(NamedState::stateForName(name), nullptr);
}

void tst_NamedState::theSecondStateOfANameIsLeftWithoutOne()
{
    NamedState first("Radio");
    NamedState second("Radio");

    QCOMPARE(first.name(), QString("Radio"));
    QCOMPARE(second.name(), QString());
    QCOMPARE(second.objectName(), QString());
    QCOMPARE(NamedState::stateForName("Radio"), &first);
    QCOMPARE(NamedState::namedStates(), QList<NamedState *>({&first}));
    QCOMPARE(messages().take().size(), 1);
}

void tst_NamedState::aCollisionIsReportedWithBothStates()
{
    NamedState holder("Radio");
    NamedState loser("Map");
    loser.setName("Radio");

    const QList<Message> written = messages().takeMessages();
    QCOMPARE(written.size(), 1);
    QCOMPARE(written.first().type, QtWarningMsg);
    QCOMPARE(written.first().category, QString("vosk.hmistatemachine"));
    QCOMPARE(written.first().function, QString("hash"));
    QCOMPARE(written.first().text,
             QString("NamedState name collision detected!\n"
                     " \"Name: \\\"Radio\\\"\\n\" This state: "
                     " HmiStateMachine::NamedState(%1, name = \"Map\") \n"
                     " Colliding state: "
                     " HmiStateMachine::NamedState(%2, name = \"Radio\")")
                 .arg(address(&loser), address(&holder)));
}

void tst_NamedState::aCollisionLeavesTheStateOfAnotherThreadAlone()
{
    // The other thread may be renaming it just now, so that its object name must not be read.
    ChoosingState holder("Radio");
    holder.setObjectName("Renamed");

    runTogether(1, [](int) { NamedState loser("Radio"); });

    const QStringList warnings = messages().take();
    QCOMPARE(warnings.size(), 1);
    QVERIFY2(warnings.first().endsWith(
                 QString(" Colliding state:  HmiStateMachine::NamedState(%1, name = \"Radio\")")
                     .arg(address(&holder))),
             qPrintable(warnings.first()));
}

void tst_NamedState::aCollisionIsSilentWhileWarningsAreOff()
{
    messages().disableWarnings();
    NamedState first("Radio");
    NamedState second("Radio");

    QCOMPARE(second.name(), QString());
    QCOMPARE(NamedState::stateForName("Radio"), &first);
    QCOMPARE(messages().take(), QStringList());
}

void tst_NamedState::theLosersEndLeavesTheWinnersName()
{
    messages().disableWarnings();
    NamedState winner("Radio");
    QScopedPointer<NamedState> born(new NamedState("Radio"));
    QScopedPointer<NamedState> renamed(new NamedState("Map"));
    renamed->setName("Radio");

    born.reset();
    renamed.reset();

    QCOMPARE(NamedState::stateForName("Radio"), &winner);
}

void tst_NamedState::aDestroyedStateFreesItsName()
{
    QScopedPointer<NamedState> first(new NamedState("Radio"));

    first.reset();
    QCOMPARE(NamedState::stateForName("Radio"), nullptr);

    NamedState second("Radio");
    QCOMPARE(NamedState::stateForName("Radio"), &second);
}

void tst_NamedState::anEmptyNameIsNotRegistered()
{
    NamedState state;

    QCOMPARE(NamedState::hash(QString(), &state), false);
    QCOMPARE(NamedState::hash("", &state), false);
    QCOMPARE(NamedState::hash("Nobody", nullptr), false);

    QCOMPARE(NamedState::namedStates(), QList<NamedState *>());
    QCOMPARE(messages().take(), QStringList());
}

void tst_NamedState::aNameIsRegisteredOnce()
{
    NamedState holder("Radio");
    NamedState other;

    QCOMPARE(NamedState::hash("Radio", &other), false);
    QCOMPARE(NamedState::hash("Radio", &holder), false);

    QCOMPARE(NamedState::stateForName("Radio"), &holder);
    QCOMPARE(messages().take().size(), 2);
}

void tst_NamedState::aStateCanBeFoundUnderASecondName()
{
    NamedState state("Radio");

    QCOMPARE(NamedState::hash("Tuner", &state), true);

    QCOMPARE(NamedState::stateForName("Tuner"), &state);
    QCOMPARE(NamedState::stateForName("Radio"), &state);
    QCOMPARE(state.name(), QString("Radio"));
    NamedState::removeFromHash("Tuner");
    QCOMPARE(NamedState::stateForName("Tuner"), nullptr);
    QCOMPARE(NamedState::stateForName("Radio"), &state);
}

void tst_NamedState::aNameIsFreedWhicheverStateHoldsIt_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QStringList>("left");

    QTest::newRow("registered") << "Radio" << QStringList({"Map"});
    QTest::newRow("unknown") << "Nowhere" << QStringList({"Map", "Radio"});
    QTest::newRow("empty") << "" << QStringList({"Map", "Radio"});
}

void tst_NamedState::aNameIsFreedWhicheverStateHoldsIt()
{
    QFETCH(QString, name);
    QFETCH(QStringList, left);
    NamedState radio("Radio");
    NamedState map("Map");

    NamedState::removeFromHash(name);

    QCOMPARE(registeredNames(), left);
    QCOMPARE(radio.name(), QString("Radio"));
}

void tst_NamedState::theRegistryIsSharedByThreads()
{
    std::atomic<int> faults{0};

    runTogether(4, [&](int number) {
        for (int round = 0; round < 2000; ++round) {
            const QString name = QString("Thread %1 round %2").arg(number).arg(round);
            NamedState state(name);
            faults += NamedState::stateForName(name) == &state ? 0 : 1;
            faults += NamedState::namedStates().contains(&state) ? 0 : 1;
            state.setName(name + " renamed");
            faults += NamedState::stateForName(name) ? 1 : 0;
            faults += NamedState::stateForName(name + " renamed") == &state ? 0 : 1;
        }
    });

    QCOMPARE(faults.load(), 0);
}

void tst_NamedState::oneOfSeveralThreadsGetsAName()
{
    constexpr int names = 1000;
    messages().disableWarnings();
    std::atomic<int> named{0};
    QSemaphore tried;

    runTogether(4, [&](int) {
        std::vector<std::unique_ptr<NamedState>> states;
        for (int i = 0; i < names; ++i) {
            states.emplace_back(new NamedState(QString("Contested %1").arg(i)));
            named += states.back()->name().isEmpty() ? 0 : 1;
        }
        tried.release();
        tried.acquire(4); // all have tried before anyone gives up a name
        tried.release(4);
    });

    QCOMPARE(named.load(), 1000);
}

void tst_NamedState::renamingMovesTheEntry()
{
    NamedState state("Before");
    QSignalSpy renamed(&state, SIGNAL(nameChanged(Identifier)));
    QVERIFY(renamed.isValid());

    state.setName("After");

    QCOMPARE(state.name(), QString("After"));
    QCOMPARE(state.objectName(), QString("After"));
    QCOMPARE(NamedState::stateForName("Before"), nullptr);
    QCOMPARE(NamedState::stateForName("After"), &state);
    QCOMPARE(renamed.size(), 1);
    QCOMPARE(renamed.first(), QVariantList({"After"}));
}

void tst_NamedState::renamingToTheSameNameChangesNothing_data()
{
    QTest::addColumn<QString>("name");

    QTest::newRow("named") << "Radio";
    QTest::newRow("without a name") << "";
}

void tst_NamedState::renamingToTheSameNameChangesNothing()
{
    QFETCH(QString, name);
    NamedState state(name);
    state.setObjectName("Own object name");
    QSignalSpy renamed(&state, SIGNAL(nameChanged(Identifier)));
    QVERIFY(renamed.isValid());

    state.setName(name);

    QCOMPARE(renamed.size(), 0);
    QCOMPARE(state.name(), name);
    QCOMPARE(state.objectName(), QString("Own object name"));
    QCOMPARE(NamedState::namedStates().size(), name.isEmpty() ? 0 : 1);
    QCOMPARE(messages().take(), QStringList());
}

void tst_NamedState::renamingToATakenNameLosesTheOwn()
{
    NamedState a("A");
    NamedState b("B");
    QSignalSpy renamed(&a, SIGNAL(nameChanged(Identifier)));
    QVERIFY(renamed.isValid());

    a.setName("B");

    QCOMPARE(a.name(), QString());
    QCOMPARE(a.objectName(), QString("A"));
    QCOMPARE(b.name(), QString("B"));
    QCOMPARE(NamedState::namedStates(), QList<NamedState *>({&b}));
    QCOMPARE(renamed.size(), 1);
    QCOMPARE(renamed.first(), QVariantList({""}));
    QCOMPARE(messages().take().size(), 1);
    NamedState next("A");
    QCOMPARE(NamedState::stateForName("A"), &next);
}

void tst_NamedState::aStateThatLostItsNameCanTakeAnother()
{
    messages().disableWarnings();
    NamedState winner("Radio");
    NamedState loser("Radio");
    QSignalSpy renamed(&loser, SIGNAL(nameChanged(Identifier)));
    QVERIFY(renamed.isValid());

    loser.setName("Map");
    QCOMPARE(NamedState::stateForName("Map"), &loser);

    loser.setName("Radio");
    loser.setName("Radio");

    QCOMPARE(renamed, QList<QVariantList>({{"Map"}, {""}, {""}}));
    QCOMPARE(NamedState::namedStates(), QList<NamedState *>({&winner}));
}

void tst_NamedState::anEmptyNameUnregistersTheState()
{
    NamedState state("Radio");
    QSignalSpy renamed(&state, SIGNAL(nameChanged(Identifier)));
    QVERIFY(renamed.isValid());

    state.setName("");

    QCOMPARE(state.name(), QString());
    QCOMPARE(state.objectName(), QString("Radio"));
    QCOMPARE(NamedState::stateForName("Radio"), nullptr);
    QCOMPARE(NamedState::namedStates(), QList<NamedState *>());
    QCOMPARE(renamed, QList<QVariantList>({{""}}));
    QCOMPARE(messages().take(), QStringList());
}

void tst_NamedState::theNameIsChangedBeforeItIsAnnounced()
{
    NamedState state("Before");
    QStringList seen;
    connect(&state, &NamedState::nameChanged, &state, [&](const QString &name) {
        seen << name << state.name() << state.objectName() << registeredNames();
    });

    state.setName("After");

    QCOMPARE(seen, QStringList({"After", "After", "After", "After"}));
}

void tst_NamedState::theNameIsAProperty()
{
    NamedState state("Before");
    QCOMPARE(state.property("name"), QVariant("Before"));

    QVERIFY(state.setProperty("name", "Between"));
    QCOMPARE(NamedState::stateForName("Between"), &state);

    QVERIFY(QMetaObject::invokeMethod(&state, "setName", Q_ARG(Identifier, "After")));
    QCOMPARE(NamedState::stateForName("After"), &state);
}

void tst_NamedState::theNameReachesQueuedListeners()
{
    NamedState state("Before");
    NamedState listener("Listener");
    QVERIFY(connect(&state, SIGNAL(nameChanged(Identifier)), &listener, SLOT(setName(Identifier)),
                    Qt::QueuedConnection));

    QSignalSpy heard(&listener, SIGNAL(nameChanged(Identifier)));
    QVERIFY(heard.isValid());

    state.setName("After");
    state.setName("");
    QCOMPARE(heard.size(), 0);
    settle();

    QCOMPARE(heard, QList<QVariantList>({{"After"}, {""}}));
}

void tst_NamedState::aNameCanBeCarriedWithoutTheRegistry()
{
    NamedState state("Own");
    QSignalSpy renamed(&state, SIGNAL(nameChanged(Identifier)));
    QVERIFY(renamed.isValid());

    state.setNameNonHashing("Carried");

    QCOMPARE(state.name(), QString("Carried"));
    QCOMPARE(state.objectName(), QString("Own"));
    QCOMPARE(NamedState::namedStates(), QList<NamedState *>());
    QCOMPARE(renamed.size(), 0);
    NamedState next("Own");
    QCOMPARE(NamedState::stateForName("Own"), &next);
}

void tst_NamedState::sharingAnothersNameLeavesItsEntry()
{
    NamedState holder("Shared");
    NamedState first("First");
    NamedState second("Second");

    first.setNameNonHashing("Shared");
    second.setNameNonHashing("Shared");

    QCOMPARE(first.name(), QString("Shared"));
    QCOMPARE(second.name(), QString("Shared"));
    QCOMPARE(NamedState::stateForName("Shared"), &holder);
    QCOMPARE(messages().take(), QStringList());
}

void tst_NamedState::aNamesakesEndFreesTheEntryOfTheOther()
{
    NamedState holder("Shared");
    QScopedPointer<NamedState> namesake(new NamedState);
    namesake->setNameNonHashing("Shared");

    namesake.reset();

    QCOMPARE(NamedState::stateForName("Shared"), nullptr);
    QCOMPARE(holder.name(), QString("Shared"));
}

void tst_NamedState::aStateIsActiveFromEntryToExit()
{
    Flow flow;
    QList<bool> seen = {flow.away->isActive()};
    connect(flow.away, &QAbstractState::entered, [&] { seen.append(flow.away->isActive()); });
    connect(flow.away, &QAbstractState::exited, [&] { seen.append(flow.away->isActive()); });
    startIn(flow.machine, flow.home);
    QVERIFY(flow.home->isActive());
    QVERIFY(!flow.away->isActive());

    Q_EMIT flow.emitter.plain();
    QVERIFY(!flow.home->isActive());
    QVERIFY(flow.away->isActive());
    Q_EMIT flow.emitter.plain();

    QCOMPARE(seen, QList<bool>({false, true, false}));
}

void tst_NamedState::aStateIsActiveBeforeItsMonitorsAreTold()
{
    Flow flow;
    Monitor monitor("Monitor", flow.journal);
    QList<bool> seen;
    monitor.reaction = [&] { seen.append(flow.home->isActive()); };
    flow.home->registerMonitoringState(&monitor);

    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    QCOMPARE(seen, QList<bool>({true, false}));
}

void tst_NamedState::monitorsAreToldInOrderWithTheEvent()
{
    Flow flow;
    Monitor first("First", flow.journal);
    Monitor second("Second", flow.journal);
    flow.home->registerMonitoringState(&second);
    flow.home->registerMonitoringState(&first);
    auto *transition = new HmiTransition("Leave", flow.home);
    transition->setTargetState(flow.away);
    startIn(flow.machine, flow.home);

    flow.machine.postEvent(new HmiEvent("Leave", QVariant()));
    settle();
    Q_EMIT flow.emitter.plain();

    QCOMPARE(flow.journal.lines(),
             QStringList({"Second entered 0", "First entered 0", "Second exited 1260",
                          "First exited 1260", "Second entered 192", "First entered 192"}));
}

void tst_NamedState::aMonitorIsRegisteredOnce()
{
    Flow flow;
    Monitor first("First", flow.journal);
    Monitor second("Second", flow.journal);
    flow.home->registerMonitoringState(&first);
    flow.home->registerMonitoringState(&second);
    flow.home->registerMonitoringState(&first);

    startIn(flow.machine, flow.home);

    QCOMPARE(flow.journal.lines(), QStringList({"First entered 0", "Second entered 0"}));
}

void tst_NamedState::anUnregisteredMonitorIsNotTold()
{
    Flow flow;
    Monitor first("First", flow.journal);
    Monitor second("Second", flow.journal);
    flow.home->registerMonitoringState(&first);
    flow.home->registerMonitoringState(&second);
    flow.home->registerMonitoringState(&first);
    flow.home->unregisterMonitoringState(&first);
    flow.away->unregisterMonitoringState(&second);

    startIn(flow.machine, flow.home);

    QCOMPARE(flow.journal.lines(), QStringList({"Second entered 0"}));
}

void tst_NamedState::noMonitorIsIgnored()
{
    Flow flow;

    flow.home->registerMonitoringState(nullptr);
    flow.home->unregisterMonitoringState(nullptr);
    startIn(flow.machine, flow.home);

    QVERIFY(flow.home->isActive());
}

void tst_NamedState::aStateMayMonitorItself()
{
    Flow flow;
    auto *monitor = new Monitor("Monitor", flow.journal, &flow.machine);
    monitor->registerMonitoringState(monitor);
    monitor->addTransition(&flow.emitter, SIGNAL(plain()), flow.away);

    startIn(flow.machine, monitor);
    Q_EMIT flow.emitter.plain();

    QCOMPARE(flow.journal.lines(), QStringList({"Monitor entered 0", "Monitor exited 192"}));
}

void tst_NamedState::aPlainStateMonitorsWithoutEffect()
{
    Flow flow;
    NamedState monitor("Monitor");
    flow.home->registerMonitoringState(&monitor);

    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    QVERIFY(flow.away->isActive());
    QVERIFY(!monitor.isActive());
}

void tst_NamedState::monitorsAreToldAlsoWithoutLogging()
{
    Flow flow;
    Monitor monitor("Monitor", flow.journal);
    flow.home->registerMonitoringState(&monitor);
    messages().enableDebug();
    NamedState::setLoggingEnabled(false);

    startIn(flow.machine, flow.home);

    QCOMPARE(flow.journal.lines(), QStringList({"Monitor entered 0"}));
    QCOMPARE(messages().take(), QStringList());
}

void tst_NamedState::aMonitorMayUnregisterItselfWhileTold()
{
    Flow flow;
    Monitor first("First", flow.journal);
    Monitor second("Second", flow.journal);
    flow.home->registerMonitoringState(&first);
    flow.home->registerMonitoringState(&second);
    first.reaction = [&] { flow.home->unregisterMonitoringState(&first); };

    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    QCOMPARE(flow.journal.lines(),
             QStringList({"First entered 0", "Second entered 0", "Second exited 192"}));
}

void tst_NamedState::aMonitorUnregisteredByAnotherIsToldForTheLastTime()
{
    Flow flow;
    Monitor first("First", flow.journal);
    Monitor second("Second", flow.journal);
    flow.home->registerMonitoringState(&first);
    flow.home->registerMonitoringState(&second);
    first.reaction = [&] { flow.home->unregisterMonitoringState(&second); };

    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    QCOMPARE(flow.journal.lines(),
             QStringList({"First entered 0", "Second entered 0", "First exited 192"}));
}

void tst_NamedState::aMonitorRegisteredByAnotherIsToldTheNextTime()
{
    Flow flow;
    Monitor first("First", flow.journal);
    Monitor second("Second", flow.journal);
    flow.home->registerMonitoringState(&first);
    first.reaction = [&] { flow.home->registerMonitoringState(&second); };

    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    QCOMPARE(flow.journal.lines(),
             QStringList({"First entered 0", "First exited 192", "Second exited 192"}));
}

void tst_NamedState::aMonitorMayDeleteItselfWhileTold()
{
    Flow flow;
    auto *first = new Monitor("First", flow.journal);
    Monitor second("Second", flow.journal);
    flow.home->registerMonitoringState(first);
    flow.home->registerMonitoringState(&second);
    first->reaction = [first] { delete first; };

    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    QCOMPARE(flow.journal.lines(),
             QStringList({"First entered 0", "Second entered 0", "Second exited 192"}));
}

void tst_NamedState::aMonitorDeletedByAnotherIsNotTold()
{
    Flow flow;
    Monitor first("First", flow.journal);
    QScopedPointer<Monitor> second(new Monitor("Second", flow.journal));
    Monitor third("Third", flow.journal);
    for (Monitor *monitor : {&first, second.data(), &third}) {
        flow.home->registerMonitoringState(monitor);
    }
    first.reaction = [&] { second.reset(); };

    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    QCOMPARE(flow.journal.lines(),
             QStringList(
                 {"First entered 0", "Third entered 0", "First exited 192", "Third exited 192"}));
}

void tst_NamedState::aMonitorDeletedByAnotherDoesNotHearOfTheExit()
{
    Flow flow;
    Monitor first("First", flow.journal);
    QScopedPointer<Monitor> second(new Monitor("Second", flow.journal));
    flow.home->registerMonitoringState(&first);
    flow.home->registerMonitoringState(second.data());
    startIn(flow.machine, flow.home);
    first.reaction = [&] { second.reset(); };

    Q_EMIT flow.emitter.plain();

    QCOMPARE(flow.journal.lines(),
             QStringList({"First entered 0", "Second entered 0", "First exited 192"}));
}

void tst_NamedState::aMonitorDestroyedBeforehandIsNotTold()
{
    Flow flow;
    QScopedPointer<Monitor> first(new Monitor("First", flow.journal));
    Monitor second("Second", flow.journal);
    flow.home->registerMonitoringState(first.data());
    flow.home->registerMonitoringState(&second);

    first.reset();
    startIn(flow.machine, flow.home);

    QCOMPARE(flow.journal.lines(), QStringList({"Second entered 0"}));
}

void tst_NamedState::aMonitorOutlivesTheMonitoredState()
{
    Journal journal;
    Monitor monitor("Monitor", journal);
    QScopedPointer<NamedState> monitored(new NamedState("Monitored"));
    monitored->registerMonitoringState(&monitor);

    monitored.reset();

    QCOMPARE(journal.lines(), QStringList());
}

void tst_NamedState::aMonitorMayBeDestroyedAtTheEndOfTheMonitoredState()
{
    Journal journal;
    QScopedPointer<Monitor> monitor(new Monitor("Monitor", journal));
    QScopedPointer<NamedState> monitored(new NamedState("Monitored"));
    monitored->registerMonitoringState(monitor.data());
    connect(monitored.data(), &QObject::destroyed, [&] { monitor.reset(); });

    monitored.reset();

    QVERIFY(!monitor);
}

void tst_NamedState::loggingIsOffAtFirst()
{
    QCOMPARE(NamedState::loggingEnabled(), false);
}

void tst_NamedState::loggingIsSwitchedForAllStates()
{
    Flow flow;
    messages().enableDebug();
    NamedState::setLoggingEnabled(true);
    QCOMPARE(NamedState::loggingEnabled(), true);
    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    NamedState::setLoggingEnabled(false);
    QCOMPARE(NamedState::loggingEnabled(), false);
    Q_EMIT flow.emitter.plain();

    QCOMPARE(messages().take(),
             QStringList({"debug onEntry: Entering state: \"Unnamed->Home\"",
                          "debug onExit: Exiting state: \"Unnamed->Home\"",
                          "debug onEntry: Entering state: \"Unnamed->Away\""}));
}

void tst_NamedState::nothingIsLoggedWhileLoggingIsOff()
{
    Flow flow;
    messages().enableDebug();

    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    QVERIFY(flow.away->isActive());
    QCOMPARE(messages().take(), QStringList());
}

void tst_NamedState::nothingIsLoggedWhileDebugOutputIsOff()
{
    Flow flow;
    NamedState::setLoggingEnabled(true);

    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    QVERIFY(flow.away->isActive());
    QCOMPARE(messages().take(), QStringList());
}

void tst_NamedState::aPathBeginsAtTheMachine()
{
    QStateMachine machine;
    auto *a = new NamedState("A", &machine);
    auto *b = new NamedState("B", a);
    auto *c = new NamedState("C", b);
    a->setInitialState(b);
    b->setInitialState(c);
    NamedState::setLoggingEnabled(true);
    messages().enableDebug();

    startIn(machine, a);

    QCOMPARE(messages().take(),
             QStringList({"debug onEntry: Entering state: \"Unnamed->A\"",
                          "debug onEntry: Entering state: \"Unnamed->A->B\"",
                          "debug onEntry: Entering state: \"Unnamed->A->B->C\""}));
}

void tst_NamedState::exitsAreLoggedInnermostFirst()
{
    Flow flow;
    auto *list = new NamedState("List", flow.home);
    flow.home->setInitialState(list);
    startIn(flow.machine, flow.home);
    NamedState::setLoggingEnabled(true);
    messages().enableDebug();

    Q_EMIT flow.emitter.plain();

    QCOMPARE(messages().take(),
             QStringList({"debug onExit: Exiting state: \"Unnamed->Home->List\"",
                          "debug onExit: Exiting state: \"Unnamed->Home\"",
                          "debug onEntry: Entering state: \"Unnamed->Away\""}));
}

void tst_NamedState::aPathNamesEachKindOfAncestor_data()
{
    QTest::addColumn<QState *>("ancestor");
    QTest::addColumn<QString>("path");

    auto *plain = new QState;
    plain->setObjectName("Plain");
    auto *carrying = new NamedState;
    carrying->setNameNonHashing("Carried");
    QTest::newRow("plain state") << plain << "Unnamed->Unnamed->Inner";
    QTest::newRow("named state without a name")
        << static_cast<QState *>(new NamedState) << "Unnamed->->Inner";
    QTest::newRow("name out of the registry")
        << static_cast<QState *>(carrying) << "Unnamed->Carried->Inner";
}

void tst_NamedState::aPathNamesEachKindOfAncestor()
{
    QFETCH(QState *, ancestor);
    QFETCH(QString, path);
    QStateMachine machine;
    ancestor->setParent(&machine);
    auto *inner = new NamedState("Inner", ancestor);
    ancestor->setInitialState(inner);
    NamedState::setLoggingEnabled(true);
    messages().enableDebug();

    startIn(machine, ancestor);

    QVERIFY(messages().take().contains("debug onEntry: Entering state: \"" + path + '"'));
}

void tst_NamedState::logMessagesCarryTheirPlaceInTheSource()
{
    Flow flow;
    NamedState::setLoggingEnabled(true);
    messages().enableDebug();

    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    const QList<Message> written = messages().takeMessages();
    QCOMPARE(written.size(), 3);
    for (const Message &message : written) {
        QCOMPARE(message.category, QString("vosk.hmistatemachine"));
        QVERIFY(message.file.endsWith("namedstate.cpp"));
        QVERIFY(message.line > 0);
    }
    QVERIFY(written.at(0).line != written.at(1).line);
    QCOMPARE(written.at(0).line, written.at(2).line);
}

void tst_NamedState::monitorsAreToldBeforeTheEntryIsLogged()
{
    Flow flow;
    Monitor monitor("Monitor", flow.journal);
    monitor.reaction = [] { HMI_DEBUG_FROM(hmistatemachine(), "monitor") << "told"; };
    flow.home->registerMonitoringState(&monitor);
    NamedState::setLoggingEnabled(true);
    messages().enableDebug();

    startIn(flow.machine, flow.home);
    Q_EMIT flow.emitter.plain();

    QCOMPARE(messages().take(),
             QStringList({"debug monitor: told", "debug onEntry: Entering state: \"Unnamed->Home\"",
                          "debug monitor: told", "debug onExit: Exiting state: \"Unnamed->Home\"",
                          "debug onEntry: Entering state: \"Unnamed->Away\""}));
}

void tst_NamedState::aRawSignalTransitionEndsTheProcess_data()
{
    QTest::addColumn<Misuse>("misuse");

    QTest::newRow("added") << Misuse(addRaw);
    QTest::newRow("derived and added") << Misuse(addDerivedRaw);
    QTest::newRow("reparented") << Misuse(reparentRaw);
    QTest::newRow("constructed until the loop runs") << Misuse(constructRawUntilTheLoopRuns);
    QTest::newRow("constructed until entry") << Misuse(constructRawUntilTheStateIsEntered);
    QTest::newRow("constructed in an active state") << Misuse(constructRawInAnActiveState);
    QTest::newRow("constructed beside a proper one") << Misuse(constructRawBesideAProperOne);
    QTest::newRow("constructed after a check") << Misuse(constructRawAfterAnEarlierCheck);
    QTest::newRow("constructed and added") << Misuse(constructRawAndAdd);
    QTest::newRow("derived and reparented") << Misuse(reparentDerivedRaw);
    QTest::newRow("derived and constructed") << Misuse(constructDerivedRaw);
    QTest::newRow("derived plainly and added") << Misuse(addPlainDerivedRaw);
    QTest::newRow("derived plainly and constructed") << Misuse(constructPlainDerivedRaw);
    QTest::newRow("constructed in a view") << Misuse(constructRawInAViewState);
    QTest::newRow("added to a view") << Misuse(addRawToAViewState);
    QTest::newRow("reparented to a view") << Misuse(reparentRawToAViewState);
    QTest::newRow("in a view that goes back") << Misuse(constructRawInAViewStateThatGoesBack);
    QTest::newRow("in a view that goes back no more")
        << Misuse(constructRawInAViewStateThatGoesBackNoMore);
    QTest::newRow("in a view until entry") << Misuse(constructRawInAViewStateUntilItIsEntered);
    QTest::newRow("tested") << Misuse(testRaw);
}

void tst_NamedState::aRawSignalTransitionEndsTheProcess()
{
    QFETCH(Misuse, misuse);
    if (isChildProcess()) {
        Flow flow;
        startIn(flow.machine, flow.home);
        qInstallMessageHandler(printWithContext);
        misuse(flow);
        return;
    }

    const ChildResult child =
        runAsChild(QString("%1:%2").arg(QTest::currentTestFunction(), QTest::currentDataTag()));

    QVERIFY2(child.crashed, qPrintable(child.output));
    const QRegularExpression line("<default\\|transitionTypeTest\\|\\S*namedstate.cpp\\|\\d+> "
                                  "Raw QSignalTransition usage detected!\n");
    QVERIFY2(line.match(child.output).hasMatch(), qPrintable(child.output));
}

void tst_NamedState::otherChildrenAreWelcome()
{
    Flow flow;
    flow.away->addTransition(new HmiSignalTransition(&flow.emitter, SIGNAL(other())));
    flow.away->addTransition(new KeySignalTransition(&flow.emitter, SIGNAL(key(int, int)), 1, 0));
    flow.away->addTransition(new QEventTransition(&flow.emitter, QEvent::DynamicPropertyChange));
    new HmiSignalTransition(&flow.emitter, SIGNAL(other()), flow.away);
    new HmiTransition("Any", flow.away);
    (new HmiSignalTransition(&flow.emitter, SIGNAL(other())))->setParent(flow.away);
    new QObject(flow.away);
    auto *inner = new QState(flow.away);
    flow.away->setInitialState(inner);
    startIn(flow.machine, flow.home);

    Q_EMIT flow.emitter.plain();
    settle();

    QCOMPARE(flow.machine.configuration(), QSet<QAbstractState *>({flow.away, inner}));
    QCOMPARE(flow.away->transitions().size(), 7);
}

void tst_NamedState::derivedTransitionsAreWelcome()
{
    Flow flow;
    auto *view = new HmiViewState("View", &flow.machine);
    for (QState *state : {static_cast<QState *>(flow.away), static_cast<QState *>(view)}) {
        state->addTransition(new DerivedTransition(&flow.emitter, SIGNAL(other())));
        new DerivedTransition(&flow.emitter, SIGNAL(other()), state);
        new PlainDerivedTransition(&flow.emitter, SIGNAL(other()), state);
        (new PlainDerivedTransition(&flow.emitter, SIGNAL(other())))->setParent(state);
    }
    view->setHandlesBackEvent(true);
    flow.away->addTransition(&flow.emitter, SIGNAL(withInt(int)), view);
    startIn(flow.machine, flow.home);

    Q_EMIT flow.emitter.plain();
    Q_EMIT flow.emitter.withInt(1);

    QCOMPARE(flow.machine.configuration(), QSet<QAbstractState *>({view}));
}

void tst_NamedState::aRawTransitionThatIsGoneInTimeDoesNoHarm()
{
    Flow flow;
    startIn(flow.machine, flow.home);

    delete new QSignalTransition(&flow.emitter, SIGNAL(other()), flow.away);
    settle();
    Q_EMIT flow.emitter.plain();

    QVERIFY(flow.away->isActive());
}

void tst_NamedState::nothingIsNoRawTransition()
{
    NamedState state("State");

    state.transitionTypeTest(nullptr);
    QTest::ignoreMessage(QtWarningMsg, "QState::addTransition: cannot add null transition");
    state.addTransition(nullptr);

    QCOMPARE(state.transitions(), QList<QAbstractTransition *>());
}

void tst_NamedState::aSignalTransitionIsTheLibrarysOwn()
{
    Emitter emitter;
    NamedState source("Source");
    NamedState target("Target");

    HmiSignalTransition *transition = source.addTransition(&emitter, SIGNAL(plain()), &target);

    QCOMPARE(transition->metaObject(), &HmiSignalTransition::staticMetaObject);
    QCOMPARE(transition->parent(), &source);
    QCOMPARE(transition->senderObject(), &emitter);
    QCOMPARE(transition->signal(), QByteArray(SIGNAL(plain())));
    QCOMPARE(transition->targetState(), &target);
    QCOMPARE(source.transitions(), QList<QAbstractTransition *>({transition}));
}

void tst_NamedState::aSignalTransitionLeadsToItsTarget()
{
    Emitter emitter;
    QStateMachine machine;
    auto *source = new NamedState("Source", &machine);
    auto *target = new QFinalState(&machine);
    HmiSignalTransition *transition = source->addTransition(&emitter, SIGNAL(withInt(int)), target);
    QSignalSpy finished(&machine, &QStateMachine::finished);
    QSignalSpy fired(transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(finished.isValid() && fired.isValid());
    startIn(machine, source);

    Q_EMIT emitter.withInt(7);

    QCOMPARE(finished.size(), 1);
    QCOMPARE(fired.size(), 1);
    QCOMPARE(fired.first().first().toList(), QVariantList({7}));
}

void tst_NamedState::aSignalTransitionWithoutATargetStays()
{
    Flow flow;
    HmiSignalTransition *transition =
        flow.home->addTransition(&flow.emitter, SIGNAL(other()), nullptr);
    QSignalSpy fired(transition, &QAbstractTransition::triggered);
    QSignalSpy left(flow.home, &QAbstractState::exited);
    QVERIFY(fired.isValid() && left.isValid());
    startIn(flow.machine, flow.home);

    Q_EMIT flow.emitter.other();

    QCOMPARE(fired.size(), 1);
    QCOMPARE(left.size(), 0);
    QVERIFY(flow.home->isActive());
}

void tst_NamedState::aSignalTransitionWithoutASenderNeverFires()
{
    Flow flow;
    HmiSignalTransition *transition = flow.home->addTransition(nullptr, SIGNAL(other()), flow.away);
    QVERIFY(transition);
    startIn(flow.machine, flow.home);

    Q_EMIT flow.emitter.other();
    QVERIFY(flow.home->isActive());

    Q_EMIT flow.emitter.plain();
    QVERIFY(flow.away->isActive());
}

void tst_NamedState::anUnknownSignalIsReportedAndTheMachineRuns()
{
    Flow flow;
    flow.home->addTransition(&flow.emitter, SIGNAL(unheardOf()), flow.away);
    QTest::ignoreMessage(QtWarningMsg, "QSignalTransition: no such signal: Emitter::unheardOf()");

    startIn(flow.machine, flow.home);
    QVERIFY(flow.home->isActive());

    Q_EMIT flow.emitter.plain();
    QVERIFY(flow.away->isActive());
}

void tst_NamedState::aDestroyedSenderNeverFires()
{
    Flow flow;
    QScopedPointer<Emitter> sender(new Emitter);
    HmiSignalTransition *transition =
        flow.home->addTransition(sender.data(), SIGNAL(other()), flow.away);
    startIn(flow.machine, flow.home);

    sender.reset();
    Q_EMIT flow.emitter.plain();
    Q_EMIT flow.emitter.plain();

    QVERIFY(flow.home->isActive());
    QCOMPARE(transition->senderObject(), nullptr);
}

void tst_NamedState::aBlockedKeyIsSwallowedWhileTheStateIsActive()
{
    KeyFlow flow(101);
    flow.transition->makeGloballyAvailable();
    flow.closed->blockKey(101, 0, &flow.emitter, SIGNAL(key(int, int)));
    startIn(flow.machine, flow.both);

    Q_EMIT flow.emitter.plain();
    QVERIFY(flow.closed->isActive());
    Q_EMIT flow.emitter.key(101, 0);
    QVERIFY(flow.first->isActive());
    QVERIFY(flow.closed->isActive());

    Q_EMIT flow.emitter.plain();
    QVERIFY(flow.open->isActive());
    Q_EMIT flow.emitter.key(101, 0);
    QVERIFY(flow.second->isActive());
}

void tst_NamedState::anotherKeyOrStatusIsNotBlocked_data()
{
    QTest::addColumn<int>("key");
    QTest::addColumn<int>("status");

    QTest::newRow("another key") << 202 << 0;
    QTest::newRow("another status") << 201 << 1;
    QTest::newRow("every status") << 201 << -1;
    QTest::newRow("the two exchanged") << 0 << 201;
}

void tst_NamedState::anotherKeyOrStatusIsNotBlocked()
{
    QFETCH(int, key);
    QFETCH(int, status);
    KeyFlow flow(201);
    flow.transition->makeGloballyAvailable();
    flow.open->blockKey(key, status, &flow.emitter, SIGNAL(key(int, int)));
    startIn(flow.machine, flow.both);

    Q_EMIT flow.emitter.key(201, 0);

    QVERIFY(flow.second->isActive());
}

void tst_NamedState::theBlockerIsAnUnpublishedTransitionWithoutATarget()
{
    KeyFlow flow(301);
    flow.transition->makeGloballyAvailable();

    flow.open->blockKey(301, 0, &flow.emitter, SIGNAL(key(int, int)));

    const auto blockers = flow.open->findChildren<KeySignalTransition *>();
    QCOMPARE(blockers.size(), 1);
    QCOMPARE(blockers.first()->sourceState(), flow.open);
    QCOMPARE(blockers.first()->targetState(), nullptr);
    QCOMPARE(blockers.first()->senderObject(), &flow.emitter);
    QCOMPARE(
        KeySignalTransition::keySignalTransitions(&flow.emitter, SIGNAL(key(int, int)), 301, 0),
        QList<KeySignalTransition *>({flow.transition}));
}

void tst_NamedState::anActiveStateBlocksFromItsNextEntry()
{
    KeyFlow flow(401);
    flow.transition->makeGloballyAvailable();
    flow.second->addTransition(&flow.emitter, SIGNAL(other()), flow.first);
    startIn(flow.machine, flow.both);
    flow.open->blockKey(401, 0, &flow.emitter, SIGNAL(key(int, int)));

    Q_EMIT flow.emitter.key(401, 0);
    QVERIFY(flow.second->isActive());

    Q_EMIT flow.emitter.other();
    Q_EMIT flow.emitter.plain();
    Q_EMIT flow.emitter.plain();
    QVERIFY(flow.open->isActive());
    Q_EMIT flow.emitter.key(401, 0);
    QVERIFY(flow.first->isActive());
}

void tst_NamedState::aTransitionPublishedLaterIsNotBlocked()
{
    KeyFlow flow(501);
    flow.open->blockKey(501, 0, &flow.emitter, SIGNAL(key(int, int)));
    flow.transition->makeGloballyAvailable();
    startIn(flow.machine, flow.both);

    Q_EMIT flow.emitter.key(501, 0);

    QVERIFY(flow.second->isActive());
}

void tst_NamedState::publishedTransitionsAreNumberedLatestFirst()
{
    KeyFlow flow(601);
    flow.transition->makeGloballyAvailable();
    KeySignalTransition later(&flow.emitter, SIGNAL(key(int, int)), 601, 0, flow.second);
    later.makeGloballyAvailable();

    flow.closed->blockKey(601, 0, &flow.emitter, SIGNAL(key(int, int)));

    QVERIFY(later.makeParallelExclusive(1));
    QVERIFY(flow.transition->makeParallelExclusive(2));
    QCOMPARE(flow.firstFreePriority(601, 0), 4);
}

void tst_NamedState::aTransitionKeepsItsFirstPriority()
{
    KeyFlow flow(701);
    flow.transition->makeGloballyAvailable();
    QVERIFY(flow.transition->makeParallelExclusive(5));
    flow.open->blockKey(701, 0, &flow.emitter, SIGNAL(key(int, int)));
    startIn(flow.machine, flow.both);

    Q_EMIT flow.emitter.key(701, 0);

    QVERIFY(flow.transition->makeParallelExclusive(5));
    QVERIFY(flow.second->isActive());
}

void tst_NamedState::everyBlockerTakesTheNextFreePriority()
{
    KeyFlow flow(801);
    flow.transition->makeGloballyAvailable();
    flow.open->blockKey(801, 0, &flow.emitter, SIGNAL(key(int, int)));
    flow.closed->blockKey(801, 0, &flow.emitter, SIGNAL(key(int, int)));

    QCOMPARE(flow.firstFreePriority(801, 0), 4);
    startIn(flow.machine, flow.both);
    Q_EMIT flow.emitter.plain();
    Q_EMIT flow.emitter.key(801, 0);
    QVERIFY(flow.closed->isActive());
    QVERIFY(flow.first->isActive());
}

void tst_NamedState::aKeyCanBeBlockedBeforeAnyTransitionReactsToIt()
{
    KeyFlow flow(901);

    flow.open->blockKey(902, -1, &flow.emitter, SIGNAL(key(int, int)));
    startIn(flow.machine, flow.both);
    Q_EMIT flow.emitter.key(902, 3);

    QCOMPARE(flow.firstFreePriority(902, -1), 2);
    QVERIFY(flow.first->isActive());
    QVERIFY(flow.open->isActive());
}

void tst_NamedState::aKeyOfNoSenderCanBeBlocked()
{
    KeyFlow flow(1001);
    flow.open->blockKey(1001, 0, nullptr, SIGNAL(key(int, int)));
    startIn(flow.machine, flow.both);

    Q_EMIT flow.emitter.key(1001, 0);

    QVERIFY(flow.second->isActive());
}

void tst_NamedState::theInitialStateIsTheBases()
{
    NamedState state("State");
    QState child(&state);
    QState other(&state);
    QCOMPARE(state.initialState(), nullptr);

    state.setInitialState(&child);
    QCOMPARE(state.initialState(), &child);
    QCOMPARE(static_cast<QState &>(state).initialState(), &child);

    static_cast<QState &>(state).setInitialState(&other);
    QCOMPARE(state.initialState(), &other);

    state.setInitialState(nullptr);
    QCOMPARE(state.initialState(), nullptr);
}

void tst_NamedState::aSubclassTakesOverTheChoiceOfTheInitialState()
{
    QStateMachine machine;
    auto *choosing = new ChoosingState("Choosing", &machine);
    auto *asked = new NamedState("Asked", choosing);
    choosing->choice = new NamedState("Chosen", choosing);
    NamedState *base = choosing;

    base->setInitialState(asked);
    QCOMPARE(base->initialState(), asked);
    startIn(machine, base);

    QVERIFY(!asked->isActive());
    QCOMPARE(machine.configuration(), QSet<QAbstractState *>({choosing, choosing->choice}));
}

void tst_NamedState::aStateThatIsNoChildIsNoInitialState()
{
    NamedState state("State");
    QState stranger;
    QTest::ignoreMessage(QtWarningMsg,
                         QRegularExpression("QState::setInitialState: state .* is not a child"));

    state.setInitialState(&stranger);

    QCOMPARE(state.initialState(), nullptr);
}

QTEST_GUILESS_MAIN(tst_NamedState)
#include "tst_namedstate.moc"
