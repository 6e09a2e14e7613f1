#include "librarytest.h"

#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmifallbackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/simpleevent.h>

#include <QSharedPointer>
#include <QtTest>

#include <type_traits>

using namespace HmiStateMachine;

Q_DECLARE_METATYPE(QSharedPointer<QEvent>)
Q_DECLARE_METATYPE(QSharedPointer<int>)

class tst_SimpleEvent : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void eachEventReportsItsType_data();
    void eachEventReportsItsType();
    void eachKindOfEventHasANumberOfItsOwn();
    void theBaseIsMadeOfItsNumberAlone();
    void anHmiEventKeepsNameAndData();
    void anEventWithoutDataCarriesAnInvalidValue();
    void aViewEventKeepsViewAndData();
    void aPopupRequestIsNoReactivation();
    void aPopupEventKeepsWhetherItIsAReactivation_data();
    void aPopupEventKeepsWhetherItIsAReactivation();
    void aBackEventKeepsDepthAndTarget_data();
    void aBackEventKeepsDepthAndTarget();
    void aFallbackEventKeepsItsTarget();
    void anEventOwnsCopiesOfWhatItWasMadeOf();
    void anEventIsDestroyedWithItsDataThroughItsBase();
    void aFollowOnEventHasOneStepLess_data();
    void aFollowOnEventHasOneStepLess();
    void aBackRequestOfSeveralStepsEndsAfterTheLast();
    void noFollowOnEventLeadsToWhereTheFlowIs_data();
    void noFollowOnEventLeadsToWhereTheFlowIs();
};

void tst_SimpleEvent::eachEventReportsItsType_data()
{
    QTest::addColumn<QSharedPointer<QEvent>>("event");
    QTest::addColumn<int>("type");

    using Event = QSharedPointer<QEvent>;
    QTest::newRow("HmiEvent") << Event(new HmiEvent("Started", QVariant())) << 1260;
    QTest::newRow("HmiViewEvent") << Event(new HmiViewEvent("Map", QVariant())) << 1261;
    QTest::newRow("PopupEvent") << Event(new PopupEvent("Call", QVariant())) << 1262;
    QTest::newRow("reactivating PopupEvent")
        << Event(new PopupEvent("Call", true, QVariant())) << 1262;
    QTest::newRow("HmiBackEvent") << Event(new HmiBackEvent(1, "Home")) << 1263;
    QTest::newRow("HmiFallbackEvent") << Event(new HmiFallbackEvent("Home")) << 1264;
}

void tst_SimpleEvent::eachEventReportsItsType()
{
    QFETCH(QSharedPointer<QEvent>, event);

    QTEST(int(event->type()), "type");
}

void tst_SimpleEvent::eachKindOfEventHasANumberOfItsOwn()
{
    QCOMPARE(int(HmiEventType), 260);
    QCOMPARE(int(HmiViewEventType), 261);
    QCOMPARE(int(PopupEventType), 262);
    QCOMPARE(int(HmiBackEventType), 263);
    QCOMPARE(int(HmiFallbackEventType), 264);

    QCOMPARE(int(HmiEvent::eventType()), 1260);
    QCOMPARE(int(HmiViewEvent::eventType()), 1261);
    QCOMPARE(int(PopupEvent::eventType()), 1262);
    QCOMPARE(int(HmiBackEvent::eventType()), 1263);
    QCOMPARE(int(HmiFallbackEvent::eventType()), 1264);
}

void tst_SimpleEvent::theBaseIsMadeOfItsNumberAlone()
{
    const SimpleEvent<PopupEventType> event;

    QCOMPARE(int(event.type()), 1262);
    QVERIFY((std::is_base_of<SimpleEvent<HmiEventType>, HmiEvent>::value));
    QVERIFY((std::is_base_of<SimpleEvent<HmiViewEventType>, HmiViewEvent>::value));
    QVERIFY((std::is_base_of<SimpleEvent<PopupEventType>, PopupEvent>::value));
    QVERIFY((std::is_base_of<SimpleEvent<HmiBackEventType>, HmiBackEvent>::value));
    QVERIFY((std::is_base_of<SimpleEvent<HmiFallbackEventType>, HmiFallbackEvent>::value));
}

void tst_SimpleEvent::anHmiEventKeepsNameAndData()
{
    const HmiEvent event("VolumeChanged", 11);

    QCOMPARE(event.name(), QString("VolumeChanged"));
    QCOMPARE(event.data(), QVariant(11));
}

void tst_SimpleEvent::anEventWithoutDataCarriesAnInvalidValue()
{
    QVERIFY(!HmiEvent("Started", QVariant()).data().isValid());
    QVERIFY(!HmiViewEvent("Map", QVariant()).data().isValid());
    QVERIFY(!PopupEvent("Call", QVariant()).data().isValid());
    QVERIFY(!PopupEvent("Call", true, QVariant()).data().isValid());
}

void tst_SimpleEvent::aViewEventKeepsViewAndData()
{
    const HmiViewEvent event("Map", QVariantMap{{"zoom", 4}});

    QCOMPARE(event.viewId(), QString("Map"));
    QCOMPARE(event.data(), QVariant(QVariantMap{{"zoom", 4}}));
}

void tst_SimpleEvent::aPopupRequestIsNoReactivation()
{
    const PopupEvent event("Call", "Anna");

    QCOMPARE(event.target(), QString("Call"));
    QCOMPARE(event.isReactivation(), false);
    QCOMPARE(event.data(), QVariant("Anna"));
}

void tst_SimpleEvent::aPopupEventKeepsWhetherItIsAReactivation_data()
{
    QTest::addColumn<bool>("reactivation");

    QTest::newRow("first request") << false;
    QTest::newRow("return of an interrupted popup") << true;
}

void tst_SimpleEvent::aPopupEventKeepsWhetherItIsAReactivation()
{
    QFETCH(bool, reactivation);

    const PopupEvent event("Call", reactivation, 7);

    QCOMPARE(event.target(), QString("Call"));
    QCOMPARE(event.isReactivation(), reactivation);
    QCOMPARE(event.data(), QVariant(7));
}

void tst_SimpleEvent::aBackEventKeepsDepthAndTarget_data()
{
    QTest::addColumn<int>("depth");
    QTest::addColumn<QString>("target");

    QTest::newRow("no step") << 0 << "";
    QTest::newRow("one step") << 1 << "";
    QTest::newRow("towards a view") << 1 << "Home";
    QTest::newRow("as many steps as there can be") << 255 << "Home";
}

void tst_SimpleEvent::aBackEventKeepsDepthAndTarget()
{
    QFETCH(int, depth);
    QFETCH(QString, target);

    const HmiBackEvent event(static_cast<unsigned char>(depth), target);

    QCOMPARE(int(event.depth()), depth);
    QCOMPARE(event.targetId(), target);
}

void tst_SimpleEvent::aFallbackEventKeepsItsTarget()
{
    QCOMPARE(HmiFallbackEvent("system/Home").targetId(), QString("system/Home"));
    QCOMPARE(HmiFallbackEvent(QString()).targetId(), QString());
}

void tst_SimpleEvent::anEventOwnsCopiesOfWhatItWasMadeOf()
{
    QString text = "Map";
    QVariant data = 1;
    const HmiEvent event(text, data);
    const HmiViewEvent viewEvent(text, data);
    const PopupEvent popupEvent(text, data);
    const HmiBackEvent backEvent(1, text);
    const HmiFallbackEvent fallbackEvent(text);

    text = "Radio";
    data = 2;

    QCOMPARE(event.name(), QString("Map"));
    QCOMPARE(event.data(), QVariant(1));
    QCOMPARE(viewEvent.viewId(), QString("Map"));
    QCOMPARE(viewEvent.data(), QVariant(1));
    QCOMPARE(popupEvent.target(), QString("Map"));
    QCOMPARE(popupEvent.data(), QVariant(1));
    QCOMPARE(backEvent.targetId(), QString("Map"));
    QCOMPARE(fallbackEvent.targetId(), QString("Map"));
}

void tst_SimpleEvent::anEventIsDestroyedWithItsDataThroughItsBase()
{
    QSharedPointer<int> shared(new int(3));
    const QWeakPointer<int> watch = shared;
    QEvent *event = new HmiEvent("Started", QVariant::fromValue(shared));
    shared.clear();
    QVERIFY(watch.toStrongRef());

    delete event;

    QVERIFY(!watch.toStrongRef());
}

void tst_SimpleEvent::aFollowOnEventHasOneStepLess_data()
{
    QTest::addColumn<int>("depth");
    QTest::addColumn<QString>("target");
    QTest::addColumn<QString>("current");
    QTest::addColumn<int>("nextDepth");
    QTest::addColumn<QString>("nextTarget");

    QTest::newRow("three steps, the target does not travel") << 3 << "X"
                                                             << "Y" << 2 << "";
    QTest::newRow("two steps, the target does not travel") << 2 << "X"
                                                           << "Y" << 1 << "";
    QTest::newRow("two steps without a target") << 2 << ""
                                                << "Y" << 1 << "";
    QTest::newRow("several steps, although the target is reached") << 3 << "X"
                                                                   << "X" << 2 << "";
    QTest::newRow("as many steps as there can be") << 255 << "X"
                                                   << "Y" << 254 << "";
    QTest::newRow("last step, target elsewhere") << 1 << "X"
                                                 << "Y" << 1 << "X";
    QTest::newRow("no step left, target elsewhere") << 0 << "X"
                                                    << "Y" << 1 << "X";
    QTest::newRow("last step from nowhere") << 1 << "X"
                                            << "" << 1 << "X";
    QTest::newRow("target of another case") << 1 << "x"
                                            << "X" << 1 << "x";
}

void tst_SimpleEvent::aFollowOnEventHasOneStepLess()
{
    QFETCH(int, depth);
    QFETCH(QString, target);
    QFETCH(QString, current);

    const QScopedPointer<HmiBackEvent> next(
        HmiBackEvent::followOnEvent(static_cast<unsigned char>(depth), target, current));

    QVERIFY(next);
    QTEST(int(next->depth()), "nextDepth");
    QTEST(next->targetId(), "nextTarget");
    QCOMPARE(int(next->type()), 1263);
}

void tst_SimpleEvent::aBackRequestOfSeveralStepsEndsAfterTheLast()
{
    QScopedPointer<HmiBackEvent> event(new HmiBackEvent(4, "Home"));
    QList<int> depths;

    for (int presses = 0; event && presses < 10; ++presses) {
        depths.append(event->depth());
        event.reset(HmiBackEvent::followOnEvent(event->depth(), event->targetId(), "Map"));
    }

    QCOMPARE(depths, QList<int>({4, 3, 2, 1}));
}

void tst_SimpleEvent::noFollowOnEventLeadsToWhereTheFlowIs_data()
{
    QTest::addColumn<int>("depth");
    QTest::addColumn<QString>("target");
    QTest::addColumn<QString>("current");

    QTest::newRow("last step reached the target") << 1 << "X"
                                                  << "X";
    QTest::newRow("no step left, target reached") << 0 << "X"
                                                  << "X";
    QTest::newRow("last step without a target") << 1 << ""
                                                << "Y";
    QTest::newRow("no step left, no target") << 0 << ""
                                             << "Y";
    QTest::newRow("nothing known at all") << 0 << ""
                                          << "";
}

void tst_SimpleEvent::noFollowOnEventLeadsToWhereTheFlowIs()
{
    QFETCH(int, depth);
    QFETCH(QString, target);
    QFETCH(QString, current);

    const QScopedPointer<HmiBackEvent> next(
        HmiBackEvent::followOnEvent(static_cast<unsigned char>(depth), target, current));

    QVERIFY(!next);
}

QTEST_GUILESS_MAIN(tst_SimpleEvent)
#include "tst_simpleevent.moc"
