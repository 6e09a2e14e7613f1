#include "driving.h"
#include "emitter.h"
#include "librarytest.h"
#include "metadescription.h"

#include <HmiStateMachine/hmi/hmistate.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QRegularExpression>
#include <QtTest>

using namespace HmiStateMachine;

class tst_StateMachine : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void theInstanceIsOneAndBelongsToTheApplication();
    void aMachineOfOnesOwnIsNotTheInstance();
    void aMachineGoesWithItsParent();
    void theInstanceRunsATreeOfStates();
    void withoutAnInfotainmentStateTheFlagIsFalse();
    void theFlagFollowsTheInfotainmentState();
    void theValueIsStoredBeforeItIsAnnounced();
    void settingAnActiveStateIsNoticedAtTheNextUpdate();
    void theSameStateSetTwiceIsAnnouncedOnce();
    void updatingWithoutAChangeAnnouncesNothing();
    void aSelfTransitionIsLeftAndEntered();
    void aChildEnteredAnnouncesNothing();
    void aFormerStateLooksOnlyAtTheNewOne();
    void theEntryOfAFormerStateDoesNotCount();
    void leavingAFormerStateDoesNotCount();
    void aDestroyedInfotainmentStateIsNotActive();
    void withoutAStateTheFlagFallsBackToFalse();
};

namespace {

// Two screens and a signal that changes between them.
struct Flow
{
    Flow()
    {
        media->addTransition(&emitter, SIGNAL(plain()), settings);
        settings->addTransition(&emitter, SIGNAL(plain()), media);
    }

    Emitter emitter;
    StateMachine machine;
    HmiState *media = new HmiState("Media", &machine);
    HmiState *settings = new HmiState("Settings", &machine);
    QSignalSpy changes{&machine, &StateMachine::infotainmentStateActiveChanged};
};

} // namespace

void tst_StateMachine::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(StateMachine::staticMetaObject),
             QStringList({"signal infotainmentStateActiveChanged()", "slot updateActive()",
                          "property bool infotainmentStateActive read "
                          "infotainmentStateActiveChanged()"}));
    QCOMPARE(StateMachine::staticMetaObject.superClass(), &QStateMachine::staticMetaObject);
}

void tst_StateMachine::theInstanceIsOneAndBelongsToTheApplication()
{
    StateMachine *instance = StateMachine::instance();

    QVERIFY(instance);
    QCOMPARE(StateMachine::instance(), instance);
    QCOMPARE(instance->parent(), QCoreApplication::instance());
}

void tst_StateMachine::aMachineOfOnesOwnIsNotTheInstance()
{
    StateMachine own;

    QVERIFY(StateMachine::instance() != &own);
    QCOMPARE(own.parent(), nullptr);
}

void tst_StateMachine::aMachineGoesWithItsParent()
{
    QScopedPointer<QObject> owner(new QObject);
    const QPointer<StateMachine> machine = new StateMachine(owner.data());
    QCOMPARE(machine->parent(), owner.data());

    owner.reset();

    QVERIFY(!machine);
}

void tst_StateMachine::theInstanceRunsATreeOfStates()
{
    StateMachine &machine = *StateMachine::instance();
    QScopedPointer<HmiState> home(new HmiState("Home", &machine));
    QScopedPointer<HmiState> radio(new HmiState("Radio", &machine));
    auto *transition = new HmiTransition("ShowRadio", home.data());
    transition->setNamedTargetState("Radio");
    startIn(machine, home.data());

    machine.postEvent(new HmiEvent("ShowRadio", QVariant()));
    settle();

    QCOMPARE(machine.configuration(), QSet<QAbstractState *>({radio.data()}));
    park(machine);
}

void tst_StateMachine::withoutAnInfotainmentStateTheFlagIsFalse()
{
    Flow flow;
    startIn(flow.machine, flow.media);

    flow.machine.updateActive();

    QCOMPARE(flow.machine.infotainmentStateActive(), false);
    QCOMPARE(flow.machine.property("infotainmentStateActive"), QVariant(false));
    QCOMPARE(flow.changes.size(), 0);
}

void tst_StateMachine::theFlagFollowsTheInfotainmentState()
{
    Flow flow;
    flow.machine.setInfotainmentState(flow.media);
    QList<bool> values = {flow.machine.infotainmentStateActive()};
    connect(&flow.machine, &StateMachine::infotainmentStateActiveChanged, &flow.machine,
            [&] { values.append(flow.machine.property("infotainmentStateActive").toBool()); });
    startIn(flow.machine, flow.settings);
    values.append(flow.machine.infotainmentStateActive());

    Q_EMIT flow.emitter.plain();
    Q_EMIT flow.emitter.plain();
    Q_EMIT flow.emitter.plain();

    QCOMPARE(values, QList<bool>({false, false, true, false, true}));
}

void tst_StateMachine::theValueIsStoredBeforeItIsAnnounced()
{
    Flow flow;
    flow.machine.setInfotainmentState(flow.media);
    bool seen = false;
    connect(&flow.machine, &StateMachine::infotainmentStateActiveChanged, &flow.machine,
            [&] { seen = flow.machine.infotainmentStateActive() && flow.media->isActive(); });

    startIn(flow.machine, flow.media);

    QVERIFY(seen);
}

void tst_StateMachine::settingAnActiveStateIsNoticedAtTheNextUpdate()
{
    Flow flow;
    startIn(flow.machine, flow.media);
    flow.machine.setInfotainmentState(flow.media);
    QCOMPARE(flow.machine.infotainmentStateActive(), false);
    QCOMPARE(flow.changes.size(), 0);

    QVERIFY(QMetaObject::invokeMethod(&flow.machine, "updateActive"));

    QCOMPARE(flow.machine.infotainmentStateActive(), true);
    QCOMPARE(flow.changes.size(), 1);
}

void tst_StateMachine::theSameStateSetTwiceIsAnnouncedOnce()
{
    Flow flow;
    flow.machine.setInfotainmentState(flow.media);
    flow.machine.setInfotainmentState(flow.media);

    startIn(flow.machine, flow.media);

    QCOMPARE(flow.changes.size(), 1);
    QCOMPARE(flow.machine.infotainmentStateActive(), true);
}

void tst_StateMachine::updatingWithoutAChangeAnnouncesNothing()
{
    Flow flow;
    flow.machine.setInfotainmentState(flow.media);
    flow.machine.updateActive();
    QCOMPARE(flow.changes.size(), 0);
    startIn(flow.machine, flow.media);

    flow.machine.updateActive();

    QCOMPARE(flow.changes.size(), 1);
}

void tst_StateMachine::aSelfTransitionIsLeftAndEntered()
{
    Flow flow;
    flow.machine.setInfotainmentState(flow.media);
    flow.media->addTransition(&flow.emitter, SIGNAL(other()), flow.media);
    startIn(flow.machine, flow.media);
    flow.changes.clear();

    Q_EMIT flow.emitter.other();

    QCOMPARE(flow.changes.size(), 2);
    QCOMPARE(flow.machine.infotainmentStateActive(), true);
}

void tst_StateMachine::aChildEnteredAnnouncesNothing()
{
    Flow flow;
    auto *player = new HmiState("Player", flow.media);
    auto *list = new HmiState("List", flow.media);
    flow.media->setInitialState(player);
    player->addTransition(&flow.emitter, SIGNAL(other()), list);
    flow.machine.setInfotainmentState(flow.media);
    startIn(flow.machine, flow.media);
    QCOMPARE(flow.changes.size(), 1);

    Q_EMIT flow.emitter.other();

    QVERIFY(list->isActive());
    QCOMPARE(flow.changes.size(), 1);
    QCOMPARE(flow.machine.infotainmentStateActive(), true);
}

void tst_StateMachine::aFormerStateLooksOnlyAtTheNewOne()
{
    Flow flow;
    auto *phone = new HmiState("Phone", &flow.machine);
    flow.machine.setInfotainmentState(flow.media);
    startIn(flow.machine, flow.media);
    flow.machine.setInfotainmentState(phone);
    QCOMPARE(flow.machine.infotainmentStateActive(), true);

    Q_EMIT flow.emitter.plain();

    QCOMPARE(flow.machine.infotainmentStateActive(), false);
    QCOMPARE(flow.changes.size(), 2);
}

void tst_StateMachine::theEntryOfAFormerStateDoesNotCount()
{
    Flow flow;
    auto *phone = new HmiState("Phone", &flow.machine);
    flow.machine.setInfotainmentState(flow.media);
    flow.machine.setInfotainmentState(phone);

    startIn(flow.machine, flow.media);

    QCOMPARE(flow.machine.infotainmentStateActive(), false);
    QCOMPARE(flow.changes.size(), 0);
}

void tst_StateMachine::leavingAFormerStateDoesNotCount()
{
    Flow flow;
    auto *both = new HmiState("Both", &flow.machine);
    flow.media->setParent(both);
    flow.settings->setParent(both);
    both->setInitialState(flow.media);
    flow.machine.setInfotainmentState(flow.media);
    flow.machine.setInfotainmentState(both);
    startIn(flow.machine, both);

    Q_EMIT flow.emitter.plain();

    QVERIFY(flow.settings->isActive());
    QCOMPARE(flow.machine.infotainmentStateActive(), true);
    QCOMPARE(flow.changes.size(), 1);
}

void tst_StateMachine::aDestroyedInfotainmentStateIsNotActive()
{
    Flow flow;
    flow.machine.setInfotainmentState(flow.media);
    startIn(flow.machine, flow.media);
    park(flow.machine);
    QCOMPARE(flow.machine.infotainmentStateActive(), true);

    delete flow.media;
    flow.machine.updateActive();

    QCOMPARE(flow.machine.infotainmentStateActive(), false);
    QCOMPARE(flow.changes.size(), 2);
}

void tst_StateMachine::withoutAStateTheFlagFallsBackToFalse()
{
    Flow flow;
    flow.machine.setInfotainmentState(flow.media);
    startIn(flow.machine, flow.media);
    const QRegularExpression refusedConnection("QObject::connect.*null");
    QTest::ignoreMessage(QtWarningMsg, refusedConnection);
    QTest::ignoreMessage(QtWarningMsg, refusedConnection);

    flow.machine.setInfotainmentState(nullptr);
    QCOMPARE(flow.machine.infotainmentStateActive(), true);
    flow.machine.updateActive();

    QCOMPARE(flow.machine.infotainmentStateActive(), false);
}

QTEST_GUILESS_MAIN(tst_StateMachine)
#include "tst_statemachine.moc"
