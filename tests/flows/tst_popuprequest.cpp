#include "driving.h"
#include "librarytest.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

class tst_PopupRequest : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void anInterruptedPopupReturnsWhenTheOtherIsDismissed();
};

void tst_PopupRequest::anInterruptedPopupReturnsWhenTheOtherIsDismissed()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    QStateMachine machine;
    auto *layer = new HmiLayeredState("Layer", &machine);
    layer->setInitialHmiState(new HmiViewState("Home", layer));
    auto *fuel = new PopupState("car/fuel", layer, 3);
    fuel->setPopupViewId("FuelView");
    auto *call = new PopupState("phone/call", layer, 4);
    call->setPopupViewId("CallView");
    startIn(machine, layer);
    machine.postEvent(new PopupEvent("car/fuel", "low"));
    settle();
    journal.clear();

    machine.postEvent(new PopupEvent("phone/call", QVariant()));
    settle();
    machine.postEvent(new PopupEvent("phone/call_Dismiss", QVariant()));
    settle();

    QCOMPARE(journal.lines(),
             QStringList({"preparePopup CallView false", "requestPopupHide FuelView false",
                          "unstackPopup FuelView", "requestPopupShow CallView 4",
                          "unstackPopup CallView", "requestPopupHide CallView true",
                          "unstackPopup CallView", "requestPopupHide CallView true",
                          "unstackPopup CallView", "preparePopup FuelView false",
                          "requestPopupShow FuelView 3", "unstackPopup FuelView"}));
    QCOMPARE(messages().take().size(), 3);
}

QTEST_GUILESS_MAIN(tst_PopupRequest)
#include "tst_popuprequest.moc"
