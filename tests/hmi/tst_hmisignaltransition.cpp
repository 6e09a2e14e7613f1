#include "emitter.h"
#include "librarytest.h"
#include "metadescription.h"
#include "recordingviewstatetarget.h"
#include "twostates.h"

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/hmi/hmistate.h>

#include <QtTest>

#include <memory>
#include <optional>
#include <type_traits>

using namespace HmiStateMachine;

namespace {

/** What the transition holds as the arguments of its last firing. */
QVariantList keptArguments(HmiSignalTransition &transition)
{
    QSignalSpy told(&transition, &HmiSignalTransition::triggeredWithArguments);
    TriggerFunctor tell(&transition);
    tell();
    return told.value(0).value(0, QString("nothing was told")).toList();
}

} // namespace

using Emission = void (*)(Emitter &);
Q_DECLARE_METATYPE(Emission)

class tst_HmiSignalTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void theWatchedSignalMovesTheMachineAtOnce();
    void aSignalThatIsNotWatchedFiresNothing_data();
    void aSignalThatIsNotWatchedFiresNothing();
    void anUnknownSignalNeverFires();
    void withoutASenderItNeverFires();

    void itTellsTheArgumentsOfTheSignalThatFiredIt_data();
    void itTellsTheArgumentsOfTheSignalThatFiredIt();
    void itTellsItsArgumentsBeforeLaterReceiversAndTheTargetsEntry();
    void itHasNoArgumentsBeforeItsFirstFiring();
    void theArgumentsOfARefusedSignalAreNotKept();
    void theFunctorOfADestroyedTransitionDoesNothing();

    void aBlockedTransitionNeverFires();
    void aBlockedTransitionKeepsItsLastArguments();
    void aBlockedSiblingOfHigherPriorityStillTakesTheSignal();

    void theSiblingOfHighestPriorityTakesTheSignal();
    void siblingGroupsGoBySenderAndSignal_data();
    void siblingGroupsGoBySenderAndSignal();
    void aDestroyedSiblingNoLongerTakesTheSignal();
    void aSenderAtTheAddressOfAnEarlierOneFindsItsGroup();

    void itsTargetIsSetByName();
    void anUnknownTargetNameLeavesTheMachineWhereItIs();
    void aDestroyedTargetLeavesTheMachineWhereItIs();
    void itIsListedWhileItsSourceIsLeft();
    void aVoiceRequestIsPassedToTheViewLayer_data();
    void aVoiceRequestIsPassedToTheViewLayer();
    void aVoiceRequestNeedsNoViewLayer();

    void aSenderDestroyedWhileTheMachineRunsIsForgotten();
    void aSenderDestroyedBeforeTheStartIsForgotten();
    void aSenderThatDiesWithASignalQueuedFiresNothing();
    void aSenderMayDieAfterItsTransition();
    void nobodyIsToldThatADestroyedTransitionHasNoSender();
    void aNewSenderTakesThePlaceOfTheOldOne();
    void aTransitionDestroyedWhileItsSourceIsActiveFiresNoMore();
    void aTransitionMayBeDeletedLaterByItsOwnFiring();
    void aTransitionMovedWhileTheMachineRunsFiresFromItsNewSource();
    void anHmiStateTakesItAsItsOwn();
};

void tst_HmiSignalTransition::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(HmiSignalTransition::staticMetaObject),
             QStringList({"signal triggeredWithArguments(QVariantList triggerArguments)"}));
}

void tst_HmiSignalTransition::theWatchedSignalMovesTheMachineAtOnce()
{
    Emitter emitter;
    TwoStates flow;
    auto *transition = new HmiSignalTransition(&emitter, SIGNAL(plain()), flow.source);
    transition->setTargetState(flow.target);
    flow.start();

    Q_EMIT emitter.plain();

    QVERIFY(flow.target->isActive());
    QVERIFY(!flow.source->isActive());
}

void tst_HmiSignalTransition::aSignalThatIsNotWatchedFiresNothing_data()
{
    QTest::addColumn<bool>("sameSender");
    QTest::addColumn<Emission>("emission");

    QTest::newRow("another signal") << true << Emission([](Emitter &e) { Q_EMIT e.other(); });
    QTest::newRow("another sender") << false << Emission([](Emitter &e) { Q_EMIT e.plain(); });
}

void tst_HmiSignalTransition::aSignalThatIsNotWatchedFiresNothing()
{
    QFETCH(bool, sameSender);
    QFETCH(Emission, emission);
    Emitter watched;
    Emitter another;
    TwoStates flow;
    HmiSignalTransition transition(&watched, SIGNAL(plain()), flow.source);
    // The machine listens to all four combinations, so that the test of the event decides.
    HmiSignalTransition sameSenderOther(&watched, SIGNAL(other()), flow.source);
    HmiSignalTransition anotherPlain(&another, SIGNAL(plain()), flow.source);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    flow.start();

    emission(sameSender ? watched : another);

    QCOMPARE(fired.size(), 0);
}

void tst_HmiSignalTransition::anUnknownSignalNeverFires()
{
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition transition(&emitter, "2missing()", flow.source);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    QTest::ignoreMessage(QtWarningMsg, "QSignalTransition: no such signal: Emitter::missing()");

    flow.start();
    Q_EMIT emitter.plain();

    QCOMPARE(fired.size(), 0);
}

void tst_HmiSignalTransition::withoutASenderItNeverFires()
{
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition bare(flow.source);
    HmiSignalTransition senderless(nullptr, SIGNAL(plain()), flow.source);
    const HmiSignalTransition alone;
    QSignalSpy bareFired(&bare, &HmiSignalTransition::triggeredWithArguments);
    QSignalSpy senderlessFired(&senderless, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(bareFired.isValid() && senderlessFired.isValid());

    flow.start();
    Q_EMIT emitter.plain();

    QCOMPARE(bareFired.size(), 0);
    QCOMPARE(senderlessFired.size(), 0);
    QVERIFY(!alone.getSourceState());
}

void tst_HmiSignalTransition::itTellsTheArgumentsOfTheSignalThatFiredIt_data()
{
    QTest::addColumn<QByteArray>("signal");
    QTest::addColumn<Emission>("emission");
    QTest::addColumn<QVariantList>("arguments");

    QTest::newRow("none") << QByteArray(SIGNAL(plain()))
                          << Emission([](Emitter &e) { Q_EMIT e.plain(); }) << QVariantList();
    QTest::newRow("a number") << QByteArray(SIGNAL(withInt(int)))
                              << Emission([](Emitter &e) { Q_EMIT e.withInt(7); })
                              << QVariantList({7});
    QTest::newRow("a text") << QByteArray(SIGNAL(withText(QString)))
                            << Emission([](Emitter &e) { Q_EMIT e.withText("Radio"); })
                            << QVariantList({QString("Radio")});
    QTest::newRow("two") << QByteArray(SIGNAL(withTwo(int, QString)))
                         << Emission([](Emitter &e) { Q_EMIT e.withTwo(7, "Radio"); })
                         << QVariantList({7, QString("Radio")});
}

void tst_HmiSignalTransition::itTellsTheArgumentsOfTheSignalThatFiredIt()
{
    QFETCH(QByteArray, signal);
    QFETCH(Emission, emission);
    QFETCH(QVariantList, arguments);
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition transition(&emitter, signal.constData(), flow.source);
    QSignalSpy told(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(told.isValid());
    flow.start();

    emission(emitter);

    QCOMPARE(told.size(), 1);
    QCOMPARE(told.first().first().toList(), arguments);
}

void tst_HmiSignalTransition::itTellsItsArgumentsBeforeLaterReceiversAndTheTargetsEntry()
{
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition transition(&emitter, SIGNAL(withInt(int)), flow.source);
    transition.setTargetState(flow.target);
    Journal journal;
    connect(&transition, &QAbstractTransition::triggered, this,
            [&journal] { journal.add("triggered"); });
    connect(&transition, &HmiSignalTransition::triggeredWithArguments, this,
            [&journal](const QVariantList &arguments) {
                journal.add("triggeredWithArguments " + arguments.first().toString());
            });
    connect(flow.source, &QState::exited, this, [&journal] { journal.add("source exited"); });
    connect(flow.target, &QState::entered, this, [&journal] { journal.add("target entered"); });
    flow.start();

    Q_EMIT emitter.withInt(7);

    QCOMPARE(
        journal.lines(),
        QStringList({"source exited", "triggeredWithArguments 7", "triggered", "target entered"}));
}

void tst_HmiSignalTransition::itHasNoArgumentsBeforeItsFirstFiring()
{
    HmiSignalTransition transition;
    QSignalSpy told(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(told.isValid());

    TriggerFunctor tell(&transition);
    tell();

    QCOMPARE(told.size(), 1);
    QCOMPARE(told.first().first().toList(), QVariantList());
}

void tst_HmiSignalTransition::theArgumentsOfARefusedSignalAreNotKept()
{
    Emitter emitter;
    TwoRegions regions;
    HmiSignalTransition low(&emitter, SIGNAL(withInt(int)), regions.left);
    HmiSignalTransition high(&emitter, SIGNAL(withInt(int)), regions.right);
    regions.start();
    Q_EMIT emitter.withInt(7);
    park(regions.machine);
    QVERIFY(low.makeParallelExclusive(1));
    QVERIFY(high.makeParallelExclusive(2));
    regions.start();

    Q_EMIT emitter.withInt(8);

    QCOMPARE(keptArguments(low), QVariantList({7}));
    QCOMPARE(keptArguments(high), QVariantList({8}));
}

void tst_HmiSignalTransition::theFunctorOfADestroyedTransitionDoesNothing()
{
    static_assert(std::is_copy_constructible<TriggerFunctor>::value, "connect() copies it");
    auto transition = std::make_unique<HmiSignalTransition>();
    QSignalSpy told(transition.get(), &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(told.isValid());
    const TriggerFunctor tell(transition.get());

    transition.reset();
    tell();

    QCOMPARE(told.size(), 0);
}

void tst_HmiSignalTransition::aBlockedTransitionNeverFires()
{
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setTargetState(flow.target);
    flow.start();
    QVERIFY(!transition.blocked());

    transition.setBlocked(true);
    Q_EMIT emitter.plain();
    QVERIFY(transition.blocked());
    QVERIFY(flow.source->isActive());

    transition.setBlocked(false);
    Q_EMIT emitter.plain();
    QVERIFY(flow.target->isActive());
}

void tst_HmiSignalTransition::aBlockedTransitionKeepsItsLastArguments()
{
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition transition(&emitter, SIGNAL(withInt(int)), flow.source);
    flow.start();
    Q_EMIT emitter.withInt(7);

    transition.setBlocked(true);
    Q_EMIT emitter.withInt(8);

    QCOMPARE(keptArguments(transition), QVariantList({7}));
}

void tst_HmiSignalTransition::aBlockedSiblingOfHigherPriorityStillTakesTheSignal()
{
    Emitter emitter;
    TwoRegions regions;
    HmiSignalTransition low(&emitter, SIGNAL(plain()), regions.left);
    HmiSignalTransition high(&emitter, SIGNAL(plain()), regions.right);
    QVERIFY(low.makeParallelExclusive(1));
    QVERIFY(high.makeParallelExclusive(2));
    high.setBlocked(true);
    QSignalSpy lowFired(&low, &HmiSignalTransition::triggeredWithArguments);
    QSignalSpy highFired(&high, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(lowFired.isValid() && highFired.isValid());
    regions.start();

    Q_EMIT emitter.plain();

    QCOMPARE(lowFired.size(), 0);
    QCOMPARE(highFired.size(), 0);
}

void tst_HmiSignalTransition::theSiblingOfHighestPriorityTakesTheSignal()
{
    Emitter emitter;
    TwoRegions regions;
    HmiSignalTransition low(&emitter, SIGNAL(plain()), regions.left);
    HmiSignalTransition high(&emitter, SIGNAL(plain()), regions.right);
    QVERIFY(low.makeParallelExclusive(-1));
    QVERIFY(high.makeParallelExclusive(0));
    QSignalSpy lowFired(&low, &HmiSignalTransition::triggeredWithArguments);
    QSignalSpy highFired(&high, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(lowFired.isValid() && highFired.isValid());
    regions.start();

    Q_EMIT emitter.plain();

    QCOMPARE(lowFired.size(), 0);
    QCOMPARE(highFired.size(), 1);
}

void tst_HmiSignalTransition::siblingGroupsGoBySenderAndSignal_data()
{
    QTest::addColumn<bool>("sameSender");
    QTest::addColumn<QByteArray>("signal");
    QTest::addColumn<bool>("joins");

    QTest::newRow("the same") << true << QByteArray("2plain()") << false;
    QTest::newRow("another sender") << false << QByteArray("2plain()") << true;
    QTest::newRow("another signal") << true << QByteArray("2other()") << true;
    QTest::newRow("without its code") << true << QByteArray("plain()") << true;
}

void tst_HmiSignalTransition::siblingGroupsGoBySenderAndSignal()
{
    QFETCH(bool, sameSender);
    QFETCH(QByteArray, signal);
    QFETCH(bool, joins);
    Emitter emitter;
    Emitter another;
    TwoRegions regions;
    HmiSignalTransition first(&emitter, "2plain()", regions.left);
    HmiSignalTransition second(sameSender ? &emitter : &another, signal.constData(), regions.right);
    QVERIFY(first.makeParallelExclusive(3));

    QCOMPARE(second.makeParallelExclusive(3), joins);
}

void tst_HmiSignalTransition::aDestroyedSiblingNoLongerTakesTheSignal()
{
    Emitter emitter;
    TwoRegions regions;
    HmiSignalTransition low(&emitter, SIGNAL(plain()), regions.left);
    auto *high = new HmiSignalTransition(&emitter, SIGNAL(plain()), regions.right);
    QVERIFY(low.makeParallelExclusive(1));
    QVERIFY(high->makeParallelExclusive(2));
    QSignalSpy fired(&low, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    regions.start();

    delete high;
    Q_EMIT emitter.plain();

    QCOMPARE(fired.size(), 1);
}

void tst_HmiSignalTransition::aSenderAtTheAddressOfAnEarlierOneFindsItsGroup()
{
    std::optional<Emitter> sender;
    TwoRegions regions;
    sender.emplace();
    HmiSignalTransition first(&*sender, "2plain()", regions.left);
    QVERIFY(first.makeParallelExclusive(3));

    sender.emplace();
    HmiSignalTransition second(&*sender, "2plain()", regions.right);

    QVERIFY(!second.makeParallelExclusive(3));
    QVERIFY(second.makeParallelExclusive(4));
}

void tst_HmiSignalTransition::itsTargetIsSetByName()
{
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    flow.start();

    transition.setNamedTargetState("target");
    Q_EMIT emitter.plain();

    QCOMPARE(transition.targetName(), QString("target"));
    QCOMPARE(transition.getTarget(), flow.target);
    QCOMPARE(transition.getSourceState(), flow.source);
    QVERIFY(flow.target->isActive());
}

void tst_HmiSignalTransition::anUnknownTargetNameLeavesTheMachineWhereItIs()
{
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QSignalSpy left(flow.source, &QState::exited);
    QVERIFY(fired.isValid() && left.isValid());
    flow.start();

    transition.setNamedTargetState("nowhere");
    Q_EMIT emitter.plain();

    QCOMPARE(fired.size(), 1);
    QCOMPARE(left.size(), 0);
}

void tst_HmiSignalTransition::aDestroyedTargetLeavesTheMachineWhereItIs()
{
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setTargetState(flow.target);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    flow.start();

    delete flow.target;
    Q_EMIT emitter.plain();

    QCOMPARE(fired.size(), 1);
    QCOMPARE(transition.targetName(), QString());
    QVERIFY(flow.source->isActive());
}

void tst_HmiSignalTransition::itIsListedWhileItsSourceIsLeft()
{
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setTargetState(flow.target);
    QList<int> listed;
    const auto count = [&] {
        listed.append(NamedTargetTransitionBase::triggeringTransition().count(&transition));
    };
    connect(flow.source, &QState::exited, this, count);
    connect(flow.target, &QState::entered, this, count);
    flow.start();

    Q_EMIT emitter.plain();

    QCOMPARE(listed, QList<int>({1, 0}));
}

void tst_HmiSignalTransition::aVoiceRequestIsPassedToTheViewLayer_data()
{
    QTest::addColumn<bool>("isVoice");
    QTest::addColumn<QVariant>("data");
    QTest::addColumn<bool>("requested");
    QTest::addColumn<QVariant>("requestData");

    QTest::newRow("voice") << true << QVariant("tune") << true << QVariant("tune");
    QTest::newRow("voice without data") << true << QVariant() << true << QVariant();
    QTest::newRow("no voice") << false << QVariant("tune") << false << QVariant();
}

void tst_HmiSignalTransition::aVoiceRequestIsPassedToTheViewLayer()
{
    QFETCH(bool, isVoice);
    QFETCH(QVariant, data);
    Journal journal;
    RecordingViewStateTarget viewLayer(journal);
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setIsVREventTransition(isVoice, data);
    flow.start();

    Q_EMIT emitter.plain();

    QTEST(viewLayer.vrViewRequest(), "requested");
    QTEST(viewLayer.vrViewRequestData(), "requestData");
}

void tst_HmiSignalTransition::aVoiceRequestNeedsNoViewLayer()
{
    Emitter emitter;
    TwoStates flow;
    HmiSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setTargetState(flow.target);
    transition.setIsVREventTransition(true, "tune");
    flow.start();

    Q_EMIT emitter.plain();

    QVERIFY(flow.target->isActive());
}

void tst_HmiSignalTransition::aSenderDestroyedWhileTheMachineRunsIsForgotten()
{
    auto emitter = std::make_unique<Emitter>();
    Emitter another;
    TwoStates flow;
    HmiSignalTransition transition(emitter.get(), SIGNAL(plain()), flow.source);
    HmiSignalTransition onAnother(&another, SIGNAL(plain()), flow.source);
    onAnother.setTargetState(flow.target);
    flow.start();

    emitter.reset();

    QVERIFY(!transition.senderObject());
    Q_EMIT another.plain();
    QVERIFY(flow.target->isActive());
    flow.machine.stop();
    settle();
    QVERIFY(!flow.machine.isRunning());
}

void tst_HmiSignalTransition::aSenderDestroyedBeforeTheStartIsForgotten()
{
    auto emitter = std::make_unique<Emitter>();
    TwoStates flow;
    HmiSignalTransition transition(emitter.get(), SIGNAL(plain()), flow.source);

    emitter.reset();
    flow.start();

    QVERIFY(!transition.senderObject());
    QVERIFY(flow.source->isActive());
}

void tst_HmiSignalTransition::aSenderThatDiesWithASignalQueuedFiresNothing()
{
    Emitter emitter;
    auto dying = std::make_unique<Emitter>();
    TwoStates flow;
    HmiSignalTransition onwards(&emitter, SIGNAL(plain()), flow.source);
    onwards.setTargetState(flow.target);
    HmiSignalTransition transition(dying.get(), SIGNAL(plain()), flow.target);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    // The machine is busy entering the target here, so it keeps the signal for later.
    connect(flow.target, &QState::entered, this, [&dying] {
        Q_EMIT dying->plain();
        dying.reset();
    });
    flow.start();

    Q_EMIT emitter.plain();
    settle();

    QVERIFY(flow.target->isActive());
    QCOMPARE(fired.size(), 0);
}

void tst_HmiSignalTransition::aSenderMayDieAfterItsTransition()
{
    auto emitter = std::make_unique<Emitter>();
    TwoStates flow;
    auto *transition = new HmiSignalTransition(emitter.get(), SIGNAL(plain()), flow.source);
    flow.start();

    delete transition;
    emitter.reset();
    flow.machine.stop();
    settle();

    QVERIFY(!flow.machine.isRunning());
}

void tst_HmiSignalTransition::nobodyIsToldThatADestroyedTransitionHasNoSender()
{
    Emitter emitter;
    TwoStates flow;
    auto *transition = new HmiSignalTransition(&emitter, SIGNAL(plain()), flow.source);
    int told = 0;
    connect(transition, &QSignalTransition::senderObjectChanged, this, [&told] { ++told; });
    transition->setSenderObject(&flow.machine);
    QCOMPARE(told, 1);

    delete transition;

    QCOMPARE(told, 1);
}

void tst_HmiSignalTransition::aNewSenderTakesThePlaceOfTheOldOne()
{
    auto former = std::make_unique<Emitter>();
    Emitter present;
    TwoStates flow;
    HmiSignalTransition transition(former.get(), SIGNAL(plain()), flow.source);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    flow.start();

    transition.setSenderObject(&present);
    Q_EMIT former->plain();
    QCOMPARE(fired.size(), 0);

    former.reset();
    QCOMPARE(transition.senderObject(), &present);
    Q_EMIT present.plain();
    QCOMPARE(fired.size(), 1);
}

void tst_HmiSignalTransition::aTransitionDestroyedWhileItsSourceIsActiveFiresNoMore()
{
    Emitter emitter;
    TwoStates flow;
    auto *transition = new HmiSignalTransition(&emitter, SIGNAL(plain()), flow.source);
    transition->setTargetState(flow.target);
    flow.start();

    delete transition;
    Q_EMIT emitter.plain();

    QVERIFY(flow.source->isActive());
    flow.machine.stop();
    settle();
    QVERIFY(!flow.machine.isRunning());
}

void tst_HmiSignalTransition::aTransitionMayBeDeletedLaterByItsOwnFiring()
{
    Emitter emitter;
    TwoStates flow;
    QPointer<HmiSignalTransition> transition =
        new HmiSignalTransition(&emitter, SIGNAL(plain()), flow.source);
    transition->setTargetState(flow.target);
    connect(transition, &HmiSignalTransition::triggeredWithArguments, transition,
            &QObject::deleteLater);
    flow.start();

    Q_EMIT emitter.plain();
    settle();

    QVERIFY(!transition);
    QVERIFY(flow.target->isActive());
}

void tst_HmiSignalTransition::aTransitionMovedWhileTheMachineRunsFiresFromItsNewSource()
{
    Emitter emitter;
    TwoStates flow;
    auto *onwards = new HmiSignalTransition(&emitter, SIGNAL(other()), flow.source);
    onwards->setTargetState(flow.target);
    auto *transition = new HmiSignalTransition(&emitter, SIGNAL(plain()), flow.source);
    QSignalSpy fired(transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    flow.start();

    flow.target->addTransition(transition);
    Q_EMIT emitter.plain();
    QCOMPARE(fired.size(), 0);

    Q_EMIT emitter.other();
    Q_EMIT emitter.plain();
    QCOMPARE(fired.size(), 1);
    QCOMPARE(transition->getSourceState(), flow.target);
}

void tst_HmiSignalTransition::anHmiStateTakesItAsItsOwn()
{
    Emitter emitter;
    QStateMachine machine;
    auto *state = new HmiState("state", &machine);
    auto *transition = new HmiSignalTransition(&emitter, SIGNAL(plain()));
    QSignalSpy fired(transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());

    state->addHmiTransition(transition);
    startIn(machine, state);
    Q_EMIT emitter.plain();

    QCOMPARE(transition->getSourceState(), state);
    QCOMPARE(transition->parent(), state);
    QCOMPARE(fired.size(), 1);
}

QTEST_GUILESS_MAIN(tst_HmiSignalTransition)
#include "tst_hmisignaltransition.moc"
