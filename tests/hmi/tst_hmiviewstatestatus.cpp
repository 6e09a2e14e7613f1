#include "driving.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** Radio follows the reports of the view layer and writes what it makes of them. */
struct StatusFlow : public ViewFlow
{
    StatusFlow()
    {
        QObject::connect(radio, &HmiViewState::viewActivated, &machine,
                         [this] { journal.add("viewActivated"); });
        QObject::connect(radio, &HmiViewState::viewDeactivated, &machine,
                         [this] { journal.add("viewDeactivated"); });
        QObject::connect(radio, &HmiViewState::viewAnimationStarted, &machine, [this](int type) {
            journal.add("viewAnimationStarted " + QString::number(type));
        });
    }

    /** The view layer shows @p view instead of @p before. */
    QStringList report(const QString &before, const QString &view)
    {
        journal.clear();
        Q_EMIT target.viewActivated(before, view);
        return take();
    }

    QStringList reportAnimation(const QString &view, int type)
    {
        journal.clear();
        Q_EMIT target.viewAnimationStarted(view, type);
        return take();
    }

    HmiViewState *home = view("Home");
    HmiViewState *radio = viewOf("RadioScreen", "Radio");
};

/** A view layer that shows a view at once. */
class PromptTarget : public RecordingViewStateTarget
{
public:
    using RecordingViewStateTarget::RecordingViewStateTarget;

    void activateView(const QString &viewId, const QVariant &instanceData) override
    {
        RecordingViewStateTarget::activateView(viewId, instanceData);
        Q_EMIT viewActivated(QString(), viewId);
    }
};

} // namespace

class tst_HmiViewStateStatus : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void reportsAreNotFollowedUnlessAskedFor();
    void theViewIsToldThatItIsShown();
    void onlyTheNewViewCounts();
    void anotherViewEndsTheReports();
    void theNextEntryFollowsTheReportsAgain();
    void animationsOfTheViewArePassedOn();
    void animationsOfOtherViewsAreNot();
    void aViewThatIsLeftIsNotToldOfViews();
    void aViewThatIsLeftStillHearsOfItsAnimations();
    void enteringAgainConnectsOnce();
    void switchedOnWhileActiveItWorksAtOnce();
    void switchedOnWhileInactiveItWorksFromTheNextEntry();
    void switchedOffItWorksNoMore();
    void switchedOffWhileInactiveItWorksNoMore();
    void switchingOnTwiceConnectsOnce();
    void theConnectionIsMadeBeforeTheActivation();
    void withoutAViewLayerNothingIsConnected();
    void aDummyIsNotConnectedOnEntry();
    void aViewThatIsDestroyedHearsNothing();
};

void tst_HmiViewStateStatus::reportsAreNotFollowedUnlessAskedFor()
{
    StatusFlow flow;
    flow.start(flow.radio);

    QVERIFY(!flow.radio->reportsQmlViewStatus());
    QCOMPARE(flow.report("", "RadioScreen"), QStringList());
    QCOMPARE(flow.report("RadioScreen", "Home"), QStringList());
    QCOMPARE(flow.reportAnimation("RadioScreen", 1), QStringList());
}

void tst_HmiViewStateStatus::theViewIsToldThatItIsShown()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.home);
    QVERIFY(flow.radio->reportsQmlViewStatus());
    QCOMPARE(flow.report("Home", "RadioScreen"), QStringList());

    flow.request("Radio");

    QCOMPARE(flow.report("Home", "RadioScreen"), QStringList("viewActivated"));
    QCOMPARE(flow.report("Home", "RadioScreen"), QStringList("viewActivated"));
}

void tst_HmiViewStateStatus::onlyTheNewViewCounts()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.radio);

    QCOMPARE(flow.report("RadioScreen", "RadioScreen"), QStringList("viewActivated"));
    QCOMPARE(flow.report("RadioScreen", "Radio"), QStringList("viewDeactivated"));
}

void tst_HmiViewStateStatus::anotherViewEndsTheReports()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.radio);

    QCOMPARE(flow.report("RadioScreen", "Home"), QStringList("viewDeactivated"));

    QCOMPARE(flow.report("Home", "RadioScreen"), QStringList());
    QCOMPARE(flow.report("RadioScreen", "Home"), QStringList());
    QCOMPARE(flow.reportAnimation("RadioScreen", 1), QStringList());
    QVERIFY(flow.radio->reportsQmlViewStatus());
    QVERIFY(flow.radio->isActive());
}

void tst_HmiViewStateStatus::theNextEntryFollowsTheReportsAgain()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.radio);
    flow.report("RadioScreen", "Home");

    flow.request("Home");
    flow.request("Radio");

    QCOMPARE(flow.report("Home", "RadioScreen"), QStringList("viewActivated"));
    QCOMPARE(flow.reportAnimation("RadioScreen", 1), QStringList("viewAnimationStarted 1"));
}

void tst_HmiViewStateStatus::animationsOfTheViewArePassedOn()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.radio);

    QCOMPARE(flow.reportAnimation("RadioScreen", 0), QStringList("viewAnimationStarted 0"));
    QCOMPARE(flow.reportAnimation("RadioScreen", -3), QStringList("viewAnimationStarted -3"));
}

void tst_HmiViewStateStatus::animationsOfOtherViewsAreNot()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.radio);

    QCOMPARE(flow.reportAnimation("Home", 1), QStringList());
    QCOMPARE(flow.reportAnimation("Radio", 1), QStringList());
    QCOMPARE(flow.reportAnimation("RadioScreen", 1), QStringList("viewAnimationStarted 1"));
}

void tst_HmiViewStateStatus::aViewThatIsLeftIsNotToldOfViews()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.radio);
    flow.request("Home");

    QCOMPARE(flow.report("RadioScreen", "Home"), QStringList());
    QCOMPARE(flow.report("Home", "RadioScreen"), QStringList());
}

void tst_HmiViewStateStatus::aViewThatIsLeftStillHearsOfItsAnimations()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.radio);

    flow.request("Home");
    flow.report("RadioScreen", "Home");

    QCOMPARE(flow.reportAnimation("RadioScreen", 2), QStringList("viewAnimationStarted 2"));
}

void tst_HmiViewStateStatus::enteringAgainConnectsOnce()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.radio);

    flow.request("Home");
    flow.request("Radio");

    QCOMPARE(flow.report("Home", "RadioScreen"), QStringList("viewActivated"));
    QCOMPARE(flow.reportAnimation("RadioScreen", 1), QStringList("viewAnimationStarted 1"));
}

void tst_HmiViewStateStatus::switchedOnWhileActiveItWorksAtOnce()
{
    StatusFlow flow;
    flow.start(flow.radio);

    flow.radio->setReportsQmlViewStatus(true);

    QCOMPARE(flow.report("", "RadioScreen"), QStringList("viewActivated"));
}

void tst_HmiViewStateStatus::switchedOnWhileInactiveItWorksFromTheNextEntry()
{
    StatusFlow flow;
    flow.start(flow.home);

    flow.radio->setReportsQmlViewStatus(true);

    QCOMPARE(flow.reportAnimation("RadioScreen", 1), QStringList());
    flow.request("Radio");
    QCOMPARE(flow.reportAnimation("RadioScreen", 1), QStringList("viewAnimationStarted 1"));
}

void tst_HmiViewStateStatus::switchedOffItWorksNoMore()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.radio);

    flow.radio->setReportsQmlViewStatus(false);

    QVERIFY(!flow.radio->reportsQmlViewStatus());
    QCOMPARE(flow.report("", "RadioScreen"), QStringList());
    QCOMPARE(flow.reportAnimation("RadioScreen", 1), QStringList());
    flow.radio->setReportsQmlViewStatus(true);
    QCOMPARE(flow.report("", "RadioScreen"), QStringList("viewActivated"));
}

void tst_HmiViewStateStatus::switchedOffWhileInactiveItWorksNoMore()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.radio);
    flow.request("Home");

    flow.radio->setReportsQmlViewStatus(false);

    QCOMPARE(flow.reportAnimation("RadioScreen", 1), QStringList());
    flow.request("Radio");
    QCOMPARE(flow.report("Home", "RadioScreen"), QStringList());
}

void tst_HmiViewStateStatus::switchingOnTwiceConnectsOnce()
{
    StatusFlow flow;
    flow.start(flow.radio);

    flow.radio->setReportsQmlViewStatus(true);
    flow.radio->setReportsQmlViewStatus(true);

    QCOMPARE(flow.report("", "RadioScreen"), QStringList("viewActivated"));
}

void tst_HmiViewStateStatus::theConnectionIsMadeBeforeTheActivation()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    PromptTarget prompt(flow.journal);

    startIn(flow.machine, flow.radio);

    QCOMPARE(flow.take(), QStringList({"activateView RadioScreen", "viewActivated"}));
}

void tst_HmiViewStateStatus::withoutAViewLayerNothingIsConnected()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;
    flow.start(flow.radio);
    flow.radio->setReportsQmlViewStatus(false);
    flow.radio->setReportsQmlViewStatus(true);
    QCOMPARE(flow.report("", "RadioScreen"), QStringList());

    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = &flow.target;
    flow.radio->setReportsQmlViewStatus(false);
    flow.radio->setReportsQmlViewStatus(true);

    QCOMPARE(flow.report("", "RadioScreen"), QStringList("viewActivated"));
}

void tst_HmiViewStateStatus::aDummyIsNotConnectedOnEntry()
{
    StatusFlow flow;
    HmiViewState *dummy = HmiViewState::createDummyViewState("Dummy", &flow.machine, 0, false);
    dummy->setReportsQmlViewStatus(true);
    connect(dummy, &HmiViewState::viewDeactivated, this,
            [&] { flow.journal.add("dummy viewDeactivated"); });
    flow.start(dummy);

    QCOMPARE(flow.report("Radio", "Home"), QStringList());
}

void tst_HmiViewStateStatus::aViewThatIsDestroyedHearsNothing()
{
    StatusFlow flow;
    flow.radio->setReportsQmlViewStatus(true);
    flow.start(flow.radio);
    flow.request("Home");

    delete flow.radio;

    QCOMPARE(flow.report("Home", "RadioScreen"), QStringList());
    QCOMPARE(flow.reportAnimation("RadioScreen", 1), QStringList());
}

QTEST_GUILESS_MAIN(tst_HmiViewStateStatus)
#include "tst_hmiviewstatestatus.moc"
