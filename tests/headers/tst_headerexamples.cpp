// Each function includes the example of one header, as it stands in the comment of the class.

#include "driving.h"
#include "librarytest.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmiconditionalstate.h>
#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** A machine over a recording view layer, named as the examples do. */
struct Flow
{
    Journal journal;
    RecordingViewStateTarget target{journal};
    QStateMachine states;
    QStateMachine *const machine = &states;
};

} // namespace

class tst_HeaderExamples : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aGuardLetsOneTypeOfEventPass();
    void aDecisionChoosesItsTarget_data();
    void aDecisionChoosesItsTarget();
    void layersHoldScreensAndPopups();
    void backLeadsToTheViewBefore();
    void aPopupIsRequestedAndDismissed();
};

void tst_HeaderExamples::aGuardLetsOneTypeOfEventPass()
{
    Flow flow;
    auto *menu = new NamedState("Menu", flow.machine);
    auto *home = new NamedState("Home", flow.machine);
#include "guardedtransition.inc"
    startIn(flow.states, menu);

    flow.machine->postEvent(new QEvent(QEvent::MaxUser));
    settle();
    QVERIFY(menu->isActive());
    flow.machine->postEvent(new QEvent(QEvent::User));
    settle();

    QVERIFY(home->isActive());
}

void tst_HeaderExamples::aDecisionChoosesItsTarget_data()
{
    QTest::addColumn<bool>("isAccepted");
    QTest::addColumn<QString>("target");

    QTest::newRow("accepted") << true << "Map";
    QTest::newRow("not accepted") << false << "Disclaimer";
}

void tst_HeaderExamples::aDecisionChoosesItsTarget()
{
    QFETCH(bool, isAccepted);
    QFETCH(QString, target);
    Flow flow;
    QStateMachine *machine = flow.machine;
    new NamedState("Map", machine);
    new NamedState("Disclaimer", machine);
    const auto accepted = [isAccepted] { return isAccepted; };
#include "hmiconditionalstate.inc"

    startIn(flow.states, decision);

    QVERIFY(NamedState::stateForName(target)->isActive());
}

void tst_HeaderExamples::layersHoldScreensAndPopups()
{
    Flow flow;
    QStateMachine *machine = flow.machine;
#include "hmilayeredstate.inc"

    startIn(flow.states, screens);

    QCOMPARE(flow.journal.lines(), QStringList("activateView Home"));
    QCOMPARE(PopupState::stateForTarget("phone/call")->rootPopupState(), screens->popupState());
}

void tst_HeaderExamples::backLeadsToTheViewBefore()
{
    Flow flow;
    QStateMachine *machine = flow.machine;
    startIn(flow.states, new HmiViewState("Map", machine));
    flow.journal.clear();
#include "hmiviewstate.inc"

    settle();

    QCOMPARE(flow.journal.lines(),
             QStringList({"deactivateView Map", "activateView Radio", "deactivateView Radio",
                          "activateView Map"}));
}

void tst_HeaderExamples::aPopupIsRequestedAndDismissed()
{
    Flow flow;
    QStateMachine *machine = flow.machine;
    auto *layer = new PopupRootState("Layer", machine);
    startIn(flow.states, layer);
    flow.journal.clear();
#include "popupstate.inc"

    settle();

    QCOMPARE(flow.journal.lines().filter("requestPopupShow"),
             QStringList("requestPopupShow car/fuel 4"));
    QCOMPARE(flow.target.popupData("car/fuel").value("eventData").toInt(), 42);
    QCOMPARE(fuel->autoDismissInterval(), 5000);
    QVERIFY(layer->noPopupState()->isActive());
    QCOMPARE(messages().take().size(), 1); // a popup that is shown says so
}

QTEST_GUILESS_MAIN(tst_HeaderExamples)
#include "tst_headerexamples.moc"
