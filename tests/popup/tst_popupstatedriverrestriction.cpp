#include "driving.h"
#include "emitter.h"
#include "librarytest.h"
#include "popupflow.h"
#include "popupsettings.h"

#include <HmiStateMachine/named/guardedpropertychangetransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QtTest>

using namespace HmiStateMachine;

class tst_PopupStateDriverRestriction : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void anIncompletePropertyRestrictsNothing_data();
    void anIncompletePropertyRestrictsNothing();
    void aRestrictedPopupHasOneTransition();
    void theValueClosesThePopup();
    void anotherValueDoesNot();
    void theValueThatIsThereAlreadyDoesNot();
    void aPopupThatIsNoLongerRestrictedStays();
    void aRestrictionCanBeSwitchedOffWhileItFires();
    void aWaitingPopupIsNotReached();
    void restrictedPopupsOfAllLayersAreClosed();
    void theObjectMayGoFirst();
    void anObjectThatIsGoneRestrictsNothing();
};

void tst_PopupStateDriverRestriction::anIncompletePropertyRestrictsNothing_data()
{
    QTest::addColumn<bool>("object");
    QTest::addColumn<QByteArray>("property");
    QTest::addColumn<QVariant>("value");

    QTest::newRow("nothing") << false << QByteArray() << QVariant();
    QTest::newRow("no object") << false << QByteArray("value") << QVariant(3);
    QTest::newRow("no property") << true << QByteArray() << QVariant(3);
    QTest::newRow("no value") << true << QByteArray("value") << QVariant();
}

void tst_PopupStateDriverRestriction::anIncompletePropertyRestrictsNothing()
{
    QFETCH(bool, object);
    QFETCH(QByteArray, property);
    QFETCH(QVariant, value);
    Emitter car;
    const DriverRestriction restoring(car);
    PopupState::setDriverRestrictionProperty(object ? &car : nullptr, property, value);
    PopupState popup("drincomplete/fuel", 1);

    popup.setDriverRestricted(true);

    QVERIFY(!popup.driverRestricted());
    QCOMPARE(popup.transitions().size(), 1);
}

void tst_PopupStateDriverRestriction::aRestrictedPopupHasOneTransition()
{
    Emitter car;
    const DriverRestriction restriction(car);
    PopupState popup("drone/fuel", 1);

    popup.setDriverRestricted(true);
    popup.setDriverRestricted(true);
    QVERIFY(popup.driverRestricted());
    const auto transitions = popup.findChildren<GuardedPropertyChangeTransition *>();
    QCOMPARE(transitions.size(), 1);
    QCOMPARE(transitions.first()->targetState(), nullptr);

    popup.setDriverRestricted(false);
    settle();
    QVERIFY(!popup.driverRestricted());
    QCOMPARE(popup.findChildren<GuardedPropertyChangeTransition *>().size(), 0);
}

void tst_PopupStateDriverRestriction::theValueClosesThePopup()
{
    Emitter car;
    const DriverRestriction restriction(car);
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("drcloses/fuel", "FuelView");
    popup->setDriverRestricted(true);
    QSignalSpy exiting(popup, &PopupState::exitingDueToDriverRestrictions);
    QVERIFY(exiting.isValid());
    flow.start();
    flow.request("drcloses/fuel");

    car.setValue(3);
    settle();

    QCOMPARE(exiting.size(), 1);
    QVERIFY(!popup->isActive());
}

void tst_PopupStateDriverRestriction::anotherValueDoesNot()
{
    Emitter car;
    const DriverRestriction restriction(car);
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("drother/fuel", "FuelView");
    popup->setDriverRestricted(true);
    flow.start();
    flow.request("drother/fuel");

    car.setValue(2);
    settle();

    QVERIFY(popup->isActive());
}

void tst_PopupStateDriverRestriction::theValueThatIsThereAlreadyDoesNot()
{
    Emitter car;
    const DriverRestriction restriction(car);
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("drbefore/fuel", "FuelView");
    popup->setDriverRestricted(true);
    flow.start();
    car.setValue(3);

    flow.request("drbefore/fuel");
    QVERIFY(popup->isActive());

    car.setValue(0);
    car.setValue(3);
    settle();
    QVERIFY(!popup->isActive());
}

void tst_PopupStateDriverRestriction::aPopupThatIsNoLongerRestrictedStays()
{
    Emitter car;
    const DriverRestriction restriction(car);
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("drfree/fuel", "FuelView");
    popup->setDriverRestricted(true);
    flow.start();
    flow.request("drfree/fuel");

    popup->setDriverRestricted(false);
    car.setValue(3);
    settle();

    QVERIFY(popup->isActive());
}

void tst_PopupStateDriverRestriction::aRestrictionCanBeSwitchedOffWhileItFires()
{
    Emitter car;
    const DriverRestriction restriction(car);
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("drfiring/fuel", "FuelView");
    popup->setDriverRestricted(true);
    connect(popup, &PopupState::exitingDueToDriverRestrictions, popup,
            [popup] { popup->setDriverRestricted(false); });
    flow.start();
    flow.request("drfiring/fuel");

    car.setValue(3);
    settle();

    QVERIFY(!popup->driverRestricted());
    QVERIFY(!popup->isActive());
}

void tst_PopupStateDriverRestriction::aWaitingPopupIsNotReached()
{
    Emitter car;
    const DriverRestriction restriction(car);
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("drwaits/fuel", "FuelView");
    flow.popup("drwaits/call", "CallView");
    PopupFlow::rule("drwaits/fuel", PopupState::AllowStack, "drwaits/call");
    fuel->setDriverRestricted(true);
    flow.start();
    flow.request("drwaits/fuel");
    flow.request("drwaits/call");

    car.setValue(3);
    settle();
    QVERIFY(!flow.lower->wasDeactivated(fuel));

    flow.request("drwaits/call_Dismiss");
    QVERIFY(fuel->isActive());
}

void tst_PopupStateDriverRestriction::restrictedPopupsOfAllLayersAreClosed()
{
    Emitter car;
    const DriverRestriction restriction(car);
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("drall/fuel", "FuelView");
    PopupState *warn = flow.upperPopup("drall/warn", "WarnView");
    fuel->setDriverRestricted(true);
    warn->setDriverRestricted(true);
    flow.start();
    flow.request("drall/fuel");
    flow.request("drall/warn");

    car.setValue(3);
    settle();

    QVERIFY(!fuel->isActive());
    QVERIFY(!warn->isActive());
}

void tst_PopupStateDriverRestriction::theObjectMayGoFirst()
{
    QScopedPointer<Emitter> car(new Emitter);
    const DriverRestriction restriction(*car);
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("drgone/fuel", "FuelView");
    popup->setDriverRestricted(true);
    flow.start();
    flow.request("drgone/fuel");

    car.reset();
    flow.request("drgone/fuel_Dismiss");
    flow.request("drgone/fuel");

    QVERIFY(popup->isActive());
    popup->setDriverRestricted(false);
    QVERIFY(!popup->driverRestricted());
}

void tst_PopupStateDriverRestriction::anObjectThatIsGoneRestrictsNothing()
{
    QScopedPointer<Emitter> car(new Emitter);
    const DriverRestriction restriction(*car);
    car.reset();
    PopupState popup("drnever/fuel", 1);

    popup.setDriverRestricted(true);

    QVERIFY(!popup.driverRestricted());
}

QTEST_GUILESS_MAIN(tst_PopupStateDriverRestriction)
#include "tst_popupstatedriverrestriction.moc"
