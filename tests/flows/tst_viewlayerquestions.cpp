#include "driving.h"
#include "librarytest.h"
#include "popupflow.h"
#include "popupsettings.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** A view layer that looks at the flow whenever it is called. */
class AskingTarget : public RecordingViewStateTarget
{
public:
    explicit AskingTarget(Journal &journal) : RecordingViewStateTarget(journal), m_journal(journal)
    {
    }

    void activateView(const QString &viewId, const QVariant &) override
    {
        lookAtView("activate " + viewId);
    }

    void deactivateView(const QString &viewId, const QVariant &) override
    {
        lookAtView("leave " + viewId);
    }

    void preparePopup(const QString &popupId, bool) override { lookAtPopup("prepare", popupId); }
    void requestPopupShow(const QString &popupId, int, const QVariant &) override
    {
        lookAtPopup("show", popupId);
    }
    void requestPopupHide(const QString &popupId, bool) override { lookAtPopup("hide", popupId); }
    void unstackPopup(const QString &) override { }

private:
    void lookAtView(const QString &call)
    {
        const HmiViewState *view = HmiViewState::activeViewState();
        m_journal.add(call + ": " + (view ? view->name() : "none")
                      + (view && view->isActive() ? " active" : " left") + ", known \""
                      + HmiViewState::lastKnownViewState() + '"');
    }

    void lookAtPopup(const QString &call, const QString &popupId)
    {
        const PopupState *front = PopupState::getActivePopupState();
        PopupState *popup = PopupState::stateForTarget(popupId);
        m_journal.add(call + ' ' + popupId + ": in front "
                      + (front ? front->popupViewId() : QString("none"))
                      + (popup->isCurrentPopup() ? ", of its layer too" : "")
                      + (popup->rootPopupState()->wasDeactivated(popup) ? "" : ", may return"));
    }

    Journal &m_journal;
};

} // namespace

/** What a view layer finds when it asks the library from within a call of the library's. */
class tst_ViewLayerQuestions : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aViewThatIsLeftIsOnRecordAndKnownAlready();
    void aPopupIsInFrontWhenItIsShownAndNotWhenItIsLeft();
    void aPopupThatIsInterruptedMayReturn();
    void aRefusedPopupIsStoredWhenItSaysSo();
};

void tst_ViewLayerQuestions::aViewThatIsLeftIsOnRecordAndKnownAlready()
{
    ViewFlow flow;
    flow.view("Radio");
    flow.start(flow.view("Home"));
    const AskingTarget target(flow.journal);

    flow.request("Radio");

    QCOMPARE(flow.take(),
             QStringList({"leave Home: Home left, known \"Home\"",
                          "activate Radio: Radio active, known \"Home\""}));
}

void tst_ViewLayerQuestions::aPopupIsInFrontWhenItIsShownAndNotWhenItIsLeft()
{
    PopupFlow flow(messages());
    flow.popup("asking/fuel", "FuelView");
    flow.start();
    const AskingTarget target(flow.journal);

    flow.request("asking/fuel");
    QCOMPARE(flow.take(),
             QStringList({"prepare FuelView: in front none",
                          "show FuelView: in front FuelView, of its layer too, may return"}));

    flow.request("asking/fuel_Dismiss");
    QCOMPARE(flow.take(),
             QStringList({"hide FuelView: in front FuelView, of its layer too",
                          "hide FuelView: in front none, of its layer too"}));
}

void tst_ViewLayerQuestions::aPopupThatIsInterruptedMayReturn()
{
    PopupFlow flow(messages());
    flow.popup("askingtwo/fuel", "FuelView");
    flow.popup("askingtwo/call", "CallView");
    flow.start();
    flow.request("askingtwo/fuel");
    flow.take();
    const AskingTarget target(flow.journal);

    flow.request("askingtwo/call");

    QCOMPARE(flow.take(),
             QStringList({"prepare CallView: in front FuelView",
                          "hide FuelView: in front none, of its layer too, may return",
                          "show CallView: in front CallView, of its layer too, may return"}));
}

void tst_ViewLayerQuestions::aRefusedPopupIsStoredWhenItSaysSo()
{
    PopupFlow flow(messages());
    flow.popup("askingblocked/fuel", "FuelView");
    PopupState *call = flow.popup("askingblocked/call", "CallView");
    PopupFlow::rule("askingblocked/fuel", PopupState::Prohibit, "askingblocked/call");
    const StoringBlocked storing;
    connect(call, &PopupState::blocked, this, [] { PopupState::setStoreBlockedPopups(false); });
    flow.start();
    flow.request("askingblocked/fuel");
    flow.take();

    flow.request("askingblocked/call");

    QCOMPARE(flow.take(), QStringList({"releaseBlockedPopups 1"}));
}

QTEST_GUILESS_MAIN(tst_ViewLayerQuestions)
#include "tst_viewlayerquestions.moc"
