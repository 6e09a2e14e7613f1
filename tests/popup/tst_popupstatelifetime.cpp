#include "driving.h"
#include "librarytest.h"
#include "popupflow.h"
#include "popupsettings.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** Two popups of the lower layer. */
struct TwoPopups : PopupFlow
{
    TwoPopups(MessageRecorder &messages, const QString &module)
        : PopupFlow(messages), fuel(popup(module + "/fuel", "FuelView")),
          call(popup(module + "/call", "CallView"))
    {
    }

    /** Requests both; the first waits behind the second. */
    void bringUp()
    {
        start();
        request(fuel->name());
        request(call->name());
        take();
    }

    PopupState *const fuel;
    PopupState *const call;
};

/** Counts the warnings of Qt's own while it lives, and hands all messages on. */
class QtWarnings
{
public:
    QtWarnings() : m_previous(qInstallMessageHandler(&QtWarnings::handle)) { s_instance = this; }

    ~QtWarnings()
    {
        qInstallMessageHandler(m_previous);
        s_instance = nullptr;
    }

    int count() const { return m_count; }

private:
    Q_DISABLE_COPY(QtWarnings)

    static void handle(QtMsgType type, const QMessageLogContext &context, const QString &text)
    {
        if (type == QtWarningMsg && qstrcmp(context.category, "default") == 0) {
            ++s_instance->m_count;
        }
        s_instance->m_previous(type, context, text);
    }

    static QtWarnings *s_instance;
    QtMessageHandler m_previous;
    int m_count = 0;
};

QtWarnings *QtWarnings::s_instance = nullptr;

} // namespace

class tst_PopupStateLifetime : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void anActivePopupIsRemovedAndDeleted();
    void aLayerServesOnAfterThePopupRequestedLastIsDeleted_data();
    void aLayerServesOnAfterThePopupRequestedLastIsDeleted();
    void aWaitingPopupIsDeleted();
    void aStackedPopupIsDeletedWithItsReactions();
    void aPopupThatWasNeverEnteredIsDeleted();
    void aBlockedAndStoredPopupIsDeleted();
    void anActivePopupIsDeletedWithTheMachineStopped();
    void popupsAreDeletedWithTheMachineParked();
    void popupsAreDeletedWithTheMachineNeverStarted();
    void aRootIsDeletedWithItsPopups();
    void aLayerIsDeletedWithItsPopups();
    void theMachineIsDeletedWithPopupsShown();
    void theViewLayerGoesBeforeThePopups();
    void aPopupOutlivesItsRoot();
    void aPopupDeletedWhileStackedLeavesNoDanglingDismissal();
    void anActivePopupMovesToAnotherRootWithTheMachineStopped();
    void anActivePopupMovesToAnotherRootWhileTheMachineRuns();
    void aStoredPopupMovesToAnotherRoot();
    void aStackedPopupMovesToAnotherRoot();
    void aPopupLeavesItsRootForNone();
    void aWaitingPopupTakesItsTransitionsAlongFromItsRoot();
    void aDismissedPopupCanBeDeletedInItsSignal();
};

void tst_PopupStateLifetime::anActivePopupIsRemovedAndDeleted()
{
    TwoPopups flow(messages(), "liferemove");
    flow.bringUp();

    flow.lower->removePopupState(flow.call);
    settle();
    delete flow.call;

    QCOMPARE(PopupState::getActivePopupState(), nullptr);
    flow.request("liferemove/call");
    flow.request("DismissAnyPopup");
    flow.request("liferemove/fuel");
    QVERIFY(flow.fuel->isActive());
}

void tst_PopupStateLifetime::aLayerServesOnAfterThePopupRequestedLastIsDeleted_data()
{
    QTest::addColumn<bool>("moved");

    QTest::newRow("deleted in its root") << false;
    QTest::newRow("deleted in another root") << true;
}

void tst_PopupStateLifetime::aLayerServesOnAfterThePopupRequestedLastIsDeleted()
{
    QFETCH(bool, moved);
    TwoPopups flow(messages(), "lifelast");
    PopupState *mail = flow.popup("lifelast/mail", "MailView");
    lead(QEvent::Type(QEvent::User + 3), flow.fuel, flow.call);
    flow.start();
    flow.request("lifelast/fuel");
    flow.machine.postEvent(new QEvent(QEvent::Type(QEvent::User + 3)));
    settle();
    QVERIFY(flow.call->isActive());

    const QtWarnings warnings;

    if (moved) {
        flow.upper->addPopupState(flow.fuel);
    }
    delete flow.fuel;
    flow.request("CallView_Dismiss");
    flow.request("lifelast/mail");

    QVERIFY(mail->isActive());
    QCOMPARE(warnings.count(), 0);
}

void tst_PopupStateLifetime::aWaitingPopupIsDeleted()
{
    TwoPopups flow(messages(), "lifewait");
    flow.bringUp();

    flow.lower->removePopupState(flow.fuel);
    delete flow.fuel;
    flow.request("FuelView_Dismiss");
    flow.request("lifewait/fuel");
    flow.request("CallView_Dismiss");

    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
    Q_EMIT flow.lower->reset();
    flow.leave();
}

void tst_PopupStateLifetime::aStackedPopupIsDeletedWithItsReactions()
{
    TwoPopups flow(messages(), "lifestack");
    PopupFlow::rule("lifestack/fuel", PopupState::AllowStack, "lifestack/call");
    lead(QEvent::Type(QEvent::User + 3), flow.fuel, nullptr);
    const QPointer<QAbstractTransition> reaction = flow.fuel->transitions().last();
    flow.bringUp();
    QCOMPARE(reaction->sourceState(), flow.lower);

    delete flow.fuel;
    flow.machine.postEvent(new QEvent(QEvent::Type(QEvent::User + 3)));
    flow.request("CallView_Dismiss");

    QVERIFY(!reaction);
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
}

void tst_PopupStateLifetime::aPopupThatWasNeverEnteredIsDeleted()
{
    TwoPopups flow(messages(), "lifenever");
    flow.start();

    delete flow.fuel;
    flow.request("lifenever/fuel");
    flow.request("lifenever/call");

    QVERIFY(flow.call->isActive());
}

void tst_PopupStateLifetime::aBlockedAndStoredPopupIsDeleted()
{
    TwoPopups flow(messages(), "lifestored");
    const StoringBlocked storing;
    PopupFlow::rule("lifestored/fuel", PopupState::Prohibit, "lifestored/call");
    flow.bringUp();

    flow.lower->removePopupState(flow.call);
    delete flow.call;
    flow.request("CallView_Dismiss");
    PopupState::setStoreBlockedPopups(false);

    QCOMPARE(flow.take(), QStringList({"releaseBlockedPopups 0"}));
}

void tst_PopupStateLifetime::anActivePopupIsDeletedWithTheMachineStopped()
{
    TwoPopups flow(messages(), "lifestopped");
    flow.bringUp();
    park(flow.machine);

    delete flow.call;
    QCOMPARE(PopupState::getActivePopupState(), nullptr);

    flow.start();
    flow.request("lifestopped/call");
    flow.request("lifestopped/fuel");
    QVERIFY(flow.fuel->isActive());
}

void tst_PopupStateLifetime::popupsAreDeletedWithTheMachineParked()
{
    TwoPopups flow(messages(), "lifeparked");
    flow.bringUp();
    park(flow.machine);

    flow.lower->removePopupState(flow.call);
    flow.lower->removePopupState(flow.fuel);
    delete flow.call;
    delete flow.fuel;
    settle();

    QCOMPARE(PopupState::getActivePopupState(), nullptr);
    Q_EMIT flow.lower->reset();
    flow.lower->clearPopups();
}

void tst_PopupStateLifetime::popupsAreDeletedWithTheMachineNeverStarted()
{
    TwoPopups flow(messages(), "lifeunstarted");

    flow.lower->removePopupState(flow.fuel);
    delete flow.fuel;
    delete flow.call;
    flow.start();

    flow.request("lifeunstarted/fuel");
    flow.request("lifeunstarted/call");
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupStateLifetime::aRootIsDeletedWithItsPopups()
{
    TwoPopups flow(messages(), "liferoot");
    flow.bringUp();
    park(flow.machine);

    delete flow.lower;

    QCOMPARE(PopupState::getActivePopupState(), nullptr);
    QCOMPARE(PopupState::stateForTarget("liferoot/fuel"), nullptr);
    flow.target.setActiveDomain(5);
    flow.target.setActiveView("Map");
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupStateLifetime::aLayerIsDeletedWithItsPopups()
{
    PopupFlow flow(messages());
    auto *layer = new HmiLayeredState("LifeLayer", flow.work);
    auto *popup = new PopupState("lifelayer/fuel", layer, 1);
    flow.start();
    flow.request("lifelayer/fuel");
    QVERIFY(popup->isActive());
    park(flow.machine);

    delete layer;

    QCOMPARE(PopupState::getActivePopupState(), nullptr);
}

void tst_PopupStateLifetime::theMachineIsDeletedWithPopupsShown()
{
    {
        TwoPopups flow(messages(), "lifemachine");
        flow.bringUp();
        QCOMPARE(PopupState::getActivePopupState(), flow.call);
    }

    QCOMPARE(PopupState::getActivePopupState(), nullptr);
    QVERIFY(!PopupState::isStateActive("CallView"));
}

void tst_PopupStateLifetime::theViewLayerGoesBeforeThePopups()
{
    Journal journal;
    QScopedPointer<RecordingViewStateTarget> target(new RecordingViewStateTarget(journal));
    QStateMachine machine;
    auto *root = new PopupRootState("LifeRoot", &machine);
    auto *popup = new PopupState("lifeview/fuel", root, 1);
    popup->setReportsQmlPopupStatus(true);
    startIn(machine, root);
    popup->showPopup(true);
    QCOMPARE(messages().take().size(), 1);

    target.reset();
    popup->hidePopup(true);
    popup->setReportsQmlPopupStatus(false);
    popup->deactivate();

    QVERIFY(!popup->reportsQmlPopupStatus());
}

void tst_PopupStateLifetime::aPopupOutlivesItsRoot()
{
    QScopedPointer<PopupRootState> root(new PopupRootState("LifeShort"));
    PopupState popup("lifeshort/fuel", 1);
    root->addPopupState(&popup);
    popup.setAutoDismissTimeoutActive(true);
    popup.setParent(nullptr);

    root.reset();
    popup.deactivate();
    popup.stateExit();
    popup.activateDismissTransition();

    QCOMPARE(popup.rootPopupState(), nullptr);
    QVERIFY(!popup.isCurrentPopup());
}

void tst_PopupStateLifetime::aPopupDeletedWhileStackedLeavesNoDanglingDismissal()
{
    TwoPopups flow(messages(), "lifedangling");
    flow.bringUp();
    const QPointer<PopupDismissTransition> dismissal = flow.fuel->dismissTransition();
    QCOMPARE(dismissal->sourceState(), flow.lower);

    delete flow.fuel;

    QVERIFY(!dismissal);
    flow.request("DismissAnyPopup");
    QVERIFY(!flow.call->isActive());
}

void tst_PopupStateLifetime::anActivePopupMovesToAnotherRootWithTheMachineStopped()
{
    TwoPopups flow(messages(), "lifemove");
    flow.bringUp();
    park(flow.machine);

    flow.upper->addPopupState(flow.call);
    flow.start();
    flow.request("lifemove/call");

    QCOMPARE(flow.upper->activePopupState(), flow.call);
    flow.request("CallView_Dismiss");
    QCOMPARE(flow.upper->activePopupState(), flow.upper->noPopupState());
}

void tst_PopupStateLifetime::anActivePopupMovesToAnotherRootWhileTheMachineRuns()
{
    TwoPopups flow(messages(), "lifemoverun");
    flow.bringUp();

    flow.upper->addPopupState(flow.call);
    settle();

    QVERIFY(!flow.call->isActive());
    QCOMPARE(PopupState::getActivePopupState(), nullptr);
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
    flow.request("lifemoverun/call");
    QCOMPARE(flow.upper->activePopupState(), flow.call);
    flow.request("lifemoverun/fuel");
    QVERIFY(flow.fuel->isActive());
    QVERIFY(flow.call->isActive());
    flow.request("CallView_Dismiss");
    QVERIFY(!flow.call->isActive());
}

void tst_PopupStateLifetime::aStoredPopupMovesToAnotherRoot()
{
    TwoPopups flow(messages(), "lifestoredmove");
    const StoringBlocked storing;
    PopupFlow::rule("lifestoredmove/fuel", PopupState::Prohibit, "lifestoredmove/call");
    flow.bringUp();
    QCOMPARE(flow.call->dismissTransition()->sourceState(), flow.lower);

    flow.upper->addPopupState(flow.call);
    QCOMPARE(flow.call->dismissTransition()->sourceState(), flow.upper);

    flow.request("CallView_Dismiss");
    flow.take();
    PopupState::setStoreBlockedPopups(false);
    QCOMPARE(flow.take(), QStringList({"releaseBlockedPopups 0"}));
}

void tst_PopupStateLifetime::aStackedPopupMovesToAnotherRoot()
{
    TwoPopups flow(messages(), "lifestackmove");
    PopupFlow::rule("lifestackmove/fuel", PopupState::AllowStack, "lifestackmove/call");
    lead(QEvent::Type(QEvent::User + 3), flow.fuel, nullptr);
    const QAbstractTransition *reaction = flow.fuel->transitions().last();
    flow.bringUp();

    flow.upper->addPopupState(flow.fuel);

    QCOMPARE(reaction->sourceState(), flow.fuel);
    delete flow.fuel;
    flow.request("DismissAnyPopup");
    QVERIFY(!flow.call->isActive());
}

void tst_PopupStateLifetime::aPopupLeavesItsRootForNone()
{
    TwoPopups flow(messages(), "lifenone");
    flow.start();

    flow.fuel->setRootState(nullptr);
    flow.request("lifenone/fuel");

    QVERIFY(!flow.fuel->isActive());
    QCOMPARE(flow.fuel->rootPopupState(), nullptr);
    QCOMPARE(flow.fuel->parent(), nullptr);
    delete flow.fuel;
}

void tst_PopupStateLifetime::aWaitingPopupTakesItsTransitionsAlongFromItsRoot()
{
    TwoPopups flow(messages(), "lifenonewait");
    flow.fuel->setAutoDismissTimeoutActive(true);
    flow.bringUp();
    QCOMPARE(flow.fuel->dismissTransition()->sourceState(), flow.lower);

    flow.fuel->setRootState(nullptr);

    QCOMPARE(flow.fuel->dismissTransition()->sourceState(), flow.fuel);
    QCOMPARE(flow.fuel->autoDismissTransition()->targetState(), nullptr);
    delete flow.fuel;
}

void tst_PopupStateLifetime::aDismissedPopupCanBeDeletedInItsSignal()
{
    TwoPopups flow(messages(), "lifesignal");
    connect(flow.call, &QAbstractState::exited, flow.call, [&flow] {
        flow.lower->removePopupState(flow.call);
        flow.call->deleteLater();
    });
    flow.bringUp();

    flow.request("CallView_Dismiss");

    QCOMPARE(PopupState::stateForTarget("lifesignal/call"), nullptr);
    QVERIFY(flow.fuel->isActive());
}

QTEST_GUILESS_MAIN(tst_PopupStateLifetime)
#include "tst_popupstatelifetime.moc"
