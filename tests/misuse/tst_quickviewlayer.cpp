#include "driving.h"
#include "librarytest.h"
#include "quickflow.h"

#include <HmiStateMachine/popup/popupstate.h>
#include <HmiStateMachineQuick/popuphost.h>
#include <HmiStateMachineQuick/popuplistmodel.h>
#include <HmiStateMachineQuick/quickviewstatetarget.h>
#include <HmiStateMachineQuick/screenhost.h>

#include <QTime>
#include <QtTest>

using namespace HmiStateMachine;

/** What an application should not do with the view layer for Qt Quick. */
class tst_QuickViewLayer : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void noPopupIsRequestedAgain();
    void noPresenterReportsAtOnce();
    void reportsOfTheUnknownChangeNothing();
    void callsOutOfOrderLeaveNothingShown();
    void aDomainThatIsNotThereHasNoNumber();
    void hostsWithoutATargetShowNothing();
};

void tst_QuickViewLayer::noPopupIsRequestedAgain()
{
    QuickFlow flow(messages());
    PopupState *popup = flow.popup("quick/popup", "Popup");
    flow.start();

    flow.target->retryBlockedPopup(nullptr);
    flow.target->releaseBlockedPopups({{nullptr, QTime(1, 0)}, {popup, QTime(2, 0)}});
    settle();

    QVERIFY(popup->isActive());
}

void tst_QuickViewLayer::noPresenterReportsAtOnce()
{
    QuickFlow flow(messages());
    flow.view("Radio");
    flow.start();
    flow.target->setViewPresenter(nullptr);
    flow.target->setPopupPresenter(nullptr);

    flow.request("Radio");

    QCOMPARE(flow.target->activeView(), QString("Radio"));
}

void tst_QuickViewLayer::reportsOfTheUnknownChangeNothing()
{
    QuickFlow flow(messages());
    flow.start();

    flow.target->reportViewShown("Nowhere");
    flow.target->reportPopupShown("nobody");
    flow.target->reportPopupHidden("nobody");
    flow.target->updatePopupData("nobody", QVariant());

    QCOMPARE(flow.target->activeView(), QString("Home"));
    QCOMPARE(flow.target->shownPopups()->count(), 0);
}

void tst_QuickViewLayer::callsOutOfOrderLeaveNothingShown()
{
    QuickViewStateTarget target;

    target.deactivateView("Never", QVariant());
    target.requestPopupHide("never", true);
    target.unstackPopup("never");
    target.stackPopup("never", "either");
    target.unstackPopup("never");
    target.setActiveDomain(QString());

    QCOMPARE(target.activeView(), QString());
    QCOMPARE(target.shownPopups()->count(), 0);
    QVERIFY(target.stackedPopups().isEmpty());
}

void tst_QuickViewLayer::aDomainThatIsNotThereHasNoNumber()
{
    QuickViewStateTarget target;
    target.setDomains({"Home", "Home", QString()});

    target.setActiveDomain("Sea");

    QCOMPARE(target.domainFromName("Sea"), -1);
    QCOMPARE(target.domainFromName("Home"), 0);
    QCOMPARE(target.activeDomain(), -1);
}

void tst_QuickViewLayer::hostsWithoutATargetShowNothing()
{
    ScreenHost screens;
    PopupHost popups;
    screens.setTarget(nullptr);
    popups.setTarget(nullptr);

    screens.presentView("Home", false);
    popups.presentPopup("popup");
    popups.withdrawPopup("popup");

    QVERIFY(!screens.currentItem());
    QVERIFY(!popups.topItem());
}

QTEST_MAIN(tst_QuickViewLayer)
#include "tst_quickviewlayer.moc"
