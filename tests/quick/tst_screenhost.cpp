#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"
#include "quickflow.h"
#include "scene.h"

#include <HmiStateMachineQuick/hostattached.h>
#include <HmiStateMachineQuick/requests.h>
#include <HmiStateMachineQuick/screenhost.h>
#include <HmiStateMachineQuick/viewcomponent.h>

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

// Moves of an hour end when the test says so.
const QByteArray threeScreens = R"(
ScreenHost {
    duration: 3600000
    easing.type: Easing.Linear
    ViewComponent { viewId: "Home"; Item { objectName: "home" } }
    ViewComponent { viewId: "Radio"; Item { objectName: "radio"; property int typed: 0 } }
    ViewComponent { viewId: "Map"; Item { objectName: "map" } }
})";

/** A flow of the views "Home", "Radio" and "Map" over a scene, which is made before it starts. */
struct ScreenFlow : QuickFlow
{
    explicit ScreenFlow(MessageRecorder &messages, const QByteArray &qml = threeScreens,
                        const QUrl &url = QUrl("file:///scene/Scene.qml"))
        : QuickFlow(messages), scene(std::make_unique<Scene>(qml, url))
    {
        view("Radio");
        view("Map");
    }

    ScreenHost *host() const
    {
        auto *root = qobject_cast<ScreenHost *>(scene->root());
        return root ? root : scene->root()->findChild<ScreenHost *>();
    }

    QQuickItem *item(const QString &objectName) const { return itemIn(host(), objectName); }

    /** The names of the screens that there are, the visible ones with "+". */
    QStringList screensThere() const
    {
        QStringList names;
        const auto items = host()->childItems();
        for (const QQuickItem *child : items) {
            names.append(child->objectName() + (child->isVisible() ? "+" : ""));
        }
        names.sort();
        return names;
    }

    /** Requests a view and lets its screen reach its place. */
    void go(const QString &viewId)
    {
        request(viewId);
        finishMoves(host());
        settle();
    }

    std::unique_ptr<Scene> scene;
};

QString textIn(const QQuickItem *card, const QString &objectName)
{
    const auto *label = card ? card->findChild<QQuickItem *>(objectName) : nullptr;
    return label ? label->property("text").toString() : QString("no " + objectName);
}

qreal positionOf(QQuickItem *item)
{
    return qobject_cast<HostAttached *>(qmlAttachedPropertiesObject<ScreenHost>(item))->position();
}

} // namespace

class tst_ScreenHost : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectsAreAsPublished();
    void itsSettingsAtFirst();

    void aComponentIsFoundByThePattern_data();
    void aComponentIsFoundByThePattern();
    void aDeclaredComponentGoesBeforeThePattern();
    void aDeclaredSourceIsRelativeToTheFileToo();
    void aScreenGetsThePropertiesThatItDeclares();
    void thePropertiesAreThereBeforeTheBindings();
    void thePropertiesAreKeptUpToDate();
    void aScreenThatLeavesKeepsWhatItHad();

    void theFirstScreenIsThereAtOnce();
    void aScreenMovesInBeforeItIsReported();
    void backBringsAScreenInFromTheOtherSide();
    void fadingScreensStayInTheirPlace();
    void withoutAnEffectOnlyThePositionMoves();
    void withoutADurationAScreenIsReportedAtOnce();
    void aScreenArrivesByItself();
    void aViewThatIsLeftBeforeItIsShownIsNotReported();
    void theSameViewAgainStaysAndIsReported();
    void theSameViewAgainWhileItMovesInIsReportedOnce();
    void aScreenThatLeavesTakesNoInput();
    void screensFollowTheSizeOfTheHost();
    void aSceneIsInTransitionWhileAScreenMoves();

    void screensThatWereLeftAreKept_data();
    void screensThatWereLeftAreKept();
    void aKeptScreenIsAsItWasLeft();
    void aKeptScreenGetsTheDataOfTheNewActivation();
    void keepingFewerDropsTheOldest();

    void loadingMayTakeItsTime();
    void aViewThatIsLeftWhileItLoadsIsNeverShown();
    void aFileMayBeLoadedBesideTheScene();

    void whatCannotBeLoadedIsShownAndReported_data();
    void whatCannotBeLoadedIsShownAndReported();
    void aViewWithoutAComponentIsReported();
    void anotherViewWorksAfterAFailure();
    void aFailedViewIsTriedAgain();
    void theErrorItemMayBeAnother();
    void anErrorItemWithFaultsIsReportedToo();
    void warningsAreShownAndGo();

    void aLateHostShowsTheActiveView();
    void withoutItsHostTheTargetReportsAtOnce();
    void aHostThatIsDestroyedInAMoveLeavesNothing();
    void aHostOutlivesItsTarget_data();
    void aHostOutlivesItsTarget();
    void aHostMayShowAnotherTarget();
};

void tst_ScreenHost::itsMetaObjectsAreAsPublished()
{
    QCOMPARE(
        metaDescription(SceneHost::staticMetaObject),
        QStringList({"signal targetChanged()", "signal sourceChanged()",
                     "signal asynchronousChanged()", "signal durationChanged()",
                     "signal easingChanged()", "signal effectChanged()",
                     "signal errorComponentChanged()",
                     "property HmiStateMachine::QuickViewStateTarget* target read write "
                     "targetChanged()",
                     "property QString source read write sourceChanged()",
                     "property bool asynchronous read write asynchronousChanged()",
                     "property int duration read write durationChanged()",
                     "property QEasingCurve easing read write easingChanged()",
                     "property Effect effect read write effectChanged()",
                     "property QQmlComponent* errorComponent read write errorComponentChanged()",
                     "enum Effect"}));
    QCOMPARE(metaDescription(ScreenHost::staticMetaObject),
             QStringList({"signal keepChanged()", "signal currentItemChanged()",
                          "property int keep read write keepChanged()",
                          "property QQuickItem* currentItem read currentItemChanged()"}));
    QCOMPARE(metaDescription(HostedComponent::staticMetaObject),
             QStringList({"signal sourceChanged()", "signal delegateChanged()",
                          "property QUrl source read write sourceChanged()",
                          "property QQmlComponent* delegate read write delegateChanged()"}));
    QCOMPARE(metaDescription(ViewComponent::staticMetaObject),
             QStringList(
                 {"signal viewIdChanged()", "property QString viewId read write viewIdChanged()"}));
    QCOMPARE(metaDescription(HostAttached::staticMetaObject),
             QStringList(
                 {"signal positionChanged()", "property double position read positionChanged()"}));
}

void tst_ScreenHost::itsSettingsAtFirst()
{
    QuickFlow flow(messages());
    Scene scene("ScreenHost { }");
    const auto *host = qobject_cast<ScreenHost *>(scene.root());

    QCOMPARE(host->target(), flow.target.get());
    QCOMPARE(host->source(), QString());
    QCOMPARE(host->asynchronous(), false);
    QCOMPARE(host->duration(), 250);
    QCOMPARE(host->easing(), QEasingCurve(QEasingCurve::OutCubic));
    QCOMPARE(host->effect(), SceneHost::Slide);
    QCOMPARE(host->errorComponent(), nullptr);
    QCOMPARE(host->keep(), 0);
    QCOMPARE(host->currentItem(), nullptr);
    QCOMPARE(host->clip(), true);
}

void tst_ScreenHost::aComponentIsFoundByThePattern_data()
{
    QTest::addColumn<QString>("view");

    QTest::newRow("plain") << "Radio2";
    QTest::newRow("in a folder") << "Media/Player";
    QTest::newRow("number sign") << "Track #1";
    QTest::newRow("question mark") << "Leave?";
    QTest::newRow("percent sign") << "Fuel 50%";
    QTest::newRow("percent sign and digits") << "Volume%20";
    QTest::newRow("other letters") << QString::fromUtf8("Grüße");
    QTest::newRow("colon") << "Time:12";
}

void tst_ScreenHost::aComponentIsFoundByThePattern()
{
    QFETCH(QString, view);
    Files files;
    QVERIFY(files.write("views/Home.qml", "import QtQuick 2.15\nItem { objectName: 'home' }"));
    QVERIFY(
        files.write("views/" + view + ".qml", "import QtQuick 2.15\nItem { objectName: 'found' }"));
    ScreenFlow flow(messages(), "ScreenHost { source: 'views/%1.qml'; duration: 0 }",
                    files.url("Scene.qml"));
    flow.view(view);
    flow.start();
    QCOMPARE(flow.screensThere(), QStringList({"home+"}));

    flow.request(view);

    QCOMPARE(flow.screensThere(), QStringList({"found+"}));
}

void tst_ScreenHost::aDeclaredComponentGoesBeforeThePattern()
{
    Files files;
    QVERIFY(files.write("Home.qml", "import QtQuick 2.15\nItem { objectName: 'by pattern' }"));
    QVERIFY(files.write("Radio.qml", "import QtQuick 2.15\nItem { objectName: 'by pattern' }"));
    QVERIFY(files.write("Tuner.qml", "import QtQuick 2.15\nItem { objectName: 'by source' }"));
    ScreenFlow flow(messages(), R"(
        ScreenHost {
            source: "%1.qml"
            duration: 0
            ViewComponent { viewId: "Radio"; source: "Tuner.qml" }
            ViewComponent { viewId: "Map"; source: "Radio.qml"; Item { objectName: "delegate" } }
        })",
                    files.url("Scene.qml"));
    flow.start();
    QCOMPARE(flow.screensThere(), QStringList({"by pattern+"}));

    flow.request("Radio");
    QCOMPARE(flow.screensThere(), QStringList({"by source+"}));

    flow.request("Map");
    QCOMPARE(flow.screensThere(), QStringList({"delegate+"}));
}

void tst_ScreenHost::aDeclaredSourceIsRelativeToTheFileToo()
{
    Files files;
    QVERIFY(files.write("sub/Home.qml", "import QtQuick 2.15\nItem { objectName: 'home' }"));
    QVERIFY(files.write("sub/Hosted.qml", R"(
        import HmiStateMachine 1.0
        ScreenHost { ViewComponent { viewId: "Home"; source: "Home.qml" } })"));
    ScreenFlow flow(messages(), "import 'sub'\nHosted { }", files.url("Scene.qml"));

    flow.start();

    QCOMPARE(flow.screensThere(), QStringList({"home+"}));
}

void tst_ScreenHost::aScreenGetsThePropertiesThatItDeclares()
{
    ScreenFlow flow(messages(), R"(
        ScreenHost {
            ViewComponent {
                viewId: "Home"
                Item {
                    objectName: "home"
                    property string viewId
                    property var viewData
                    property var activationData
                }
            }
        })");
    flow.home->addInstanceData("greeting", "hello");
    flow.home->setActivationData("at home");

    flow.start();

    const QQuickItem *home = flow.item("home");
    QCOMPARE(home->property("viewId"), QVariant("Home"));
    QCOMPARE(home->property("viewData").toMap(),
             QVariantMap({{"eventData", QVariant()}, {"entryReason", 0}, {"greeting", "hello"}}));
    QCOMPARE(home->property("activationData"), QVariant("at home"));
    QCOMPARE(home->size(), QSizeF(400, 300));
}

void tst_ScreenHost::thePropertiesAreThereBeforeTheBindings()
{
    ScreenFlow flow(messages(), R"(
        ScreenHost {
            ViewComponent {
                viewId: "Home"
                Item {
                    objectName: "home"
                    property string viewId
                    property string atFirst
                    property real widthAtFirst
                    Component.onCompleted: { atFirst = viewId; widthAtFirst = width }
                }
            }
        })");

    flow.start();

    QCOMPARE(flow.item("home")->property("atFirst"), QVariant("Home"));
    QCOMPARE(flow.item("home")->property("widthAtFirst"), QVariant(400));
}

void tst_ScreenHost::thePropertiesAreKeptUpToDate()
{
    ScreenFlow flow(messages(), R"(
        ScreenHost {
            ViewComponent {
                viewId: "Home"
                Item { objectName: "home"; property var viewData; property var activationData }
            }
        })");
    new HmiViewState("Home", "HomeAgain", flow.screens);
    flow.start();

    flow.home->setActivationData("changed");
    QCOMPARE(flow.item("home")->property("activationData"), QVariant("changed"));

    flow.request("HomeAgain", "news");
    QCOMPARE(flow.item("home")->property("viewData").toMap().value("eventData"), QVariant("news"));
}

void tst_ScreenHost::aScreenThatLeavesKeepsWhatItHad()
{
    ScreenFlow flow(messages(), R"(
        ScreenHost {
            duration: 3600000
            ViewComponent {
                viewId: "Home"
                Item { objectName: "home"; property var viewData; property var activationData }
            }
            ViewComponent { viewId: "Radio"; Item { } }
        })");
    flow.home->setActivationData("at home");
    flow.home->addInstanceData("greeting", "hello");
    flow.start();

    flow.request("Radio", "94.7");

    const QQuickItem *home = flow.item("home");
    QVERIFY(home);
    QCOMPARE(home->property("viewData").toMap().value("greeting"), QVariant("hello"));
    QCOMPARE(home->property("activationData"), QVariant("at home"));
}

void tst_ScreenHost::theFirstScreenIsThereAtOnce()
{
    ScreenFlow flow(messages());
    QSignalSpy current(flow.host(), &ScreenHost::currentItemChanged);
    QVERIFY(current.isValid());
    flow.screens->setInitialHmiState(flow.home);

    startIn(*flow.machine, flow.unit);

    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated none Home", "activeViewChanged Home none",
                          "viewActivated none Home"}));
    QCOMPARE(flow.item("home")->x(), 0.0);
    QCOMPARE(flow.host()->currentItem(), flow.item("home"));
    QCOMPARE(current.size(), 1);
    QCOMPARE(flow.target->isTransitioning(), false);
}

void tst_ScreenHost::aScreenMovesInBeforeItIsReported()
{
    ScreenFlow flow(messages());
    flow.start();

    flow.request("Radio");
    QQuickItem *home = flow.item("home");
    QQuickItem *radio = flow.item("radio");
    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Home Radio", "activeViewChanged Radio Home",
                          "viewAnimationStarted Radio 1"}));
    QCOMPARE(positionOf(radio), 1.0);
    QCOMPARE(radio->x(), 400.0);
    QVERIFY(radio->z() > home->z());
    QCOMPARE(flow.host()->currentItem(), radio);

    moveHalfway(flow.host());
    QVERIFY(qAbs(positionOf(radio) - 0.5) < 0.01);
    QVERIFY(qAbs(positionOf(home) + 0.5) < 0.01);
    QVERIFY(qAbs(radio->x() - 200) < 4);
    QVERIFY(qAbs(home->x() + 60) < 2); // the one behind moves by less
    QCOMPARE(flow.take(), QStringList());

    finishMoves(flow.host());
    settle();
    QCOMPARE(flow.take(), QStringList({"viewActivated Home Radio"}));
    QCOMPARE(radio->x(), 0.0);
    QCOMPARE(flow.screensThere(), QStringList({"radio+"}));
}

void tst_ScreenHost::backBringsAScreenInFromTheOtherSide()
{
    ScreenFlow flow(messages());
    flow.start();
    flow.go("Radio");
    flow.take();

    flow.back();
    QQuickItem *home = flow.item("home");
    QQuickItem *radio = flow.item("radio");
    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Radio Home", "activeViewChanged Home Radio",
                          "viewAnimationStarted Home 2"}));
    QCOMPARE(positionOf(home), -1.0);
    QCOMPARE(home->x(), -120.0);
    QVERIFY(radio->z() > home->z());

    moveHalfway(flow.host());
    QVERIFY(qAbs(radio->x() - 200) < 4);

    finishMoves(flow.host());
    QCOMPARE(flow.take(), QStringList({"viewActivated Radio Home"}));
    QCOMPARE(home->x(), 0.0);
}

void tst_ScreenHost::fadingScreensStayInTheirPlace()
{
    ScreenFlow flow(messages());
    flow.host()->setProperty("effect", SceneHost::Fade);
    flow.start();

    flow.request("Radio");
    QCOMPARE(flow.item("radio")->opacity(), 0.0);
    moveHalfway(flow.host());

    QVERIFY(qAbs(flow.item("radio")->opacity() - 0.5) < 0.01);
    QVERIFY(qAbs(flow.item("home")->opacity() - 0.5) < 0.01);
    QCOMPARE(flow.item("radio")->x(), 0.0);
    finishMoves(flow.host());
    QCOMPARE(flow.item("radio")->opacity(), 1.0);
}

void tst_ScreenHost::withoutAnEffectOnlyThePositionMoves()
{
    ScreenFlow flow(messages(), R"(
        ScreenHost {
            duration: 3600000
            effect: ScreenHost.NoEffect
            ViewComponent { viewId: "Home"; Item { } }
            ViewComponent {
                viewId: "Radio"
                Item { objectName: "radio"; y: ScreenHost.position * 100 }
            }
        })");
    flow.start();

    flow.request("Radio");

    QCOMPARE(flow.item("radio")->y(), 100.0);
    QCOMPARE(flow.item("radio")->x(), 0.0);
    QCOMPARE(flow.item("radio")->opacity(), 1.0);
    finishMoves(flow.host());
    QCOMPARE(flow.item("radio")->y(), 0.0);
}

void tst_ScreenHost::withoutADurationAScreenIsReportedAtOnce()
{
    ScreenFlow flow(messages());
    flow.host()->setProperty("duration", 0);
    flow.start();

    flow.request("Radio");

    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Home Radio", "activeViewChanged Radio Home",
                          "viewActivated Home Radio"}));
    QCOMPARE(flow.screensThere(), QStringList({"radio+"}));
    QCOMPARE(flow.item("radio")->x(), 0.0);
    QCOMPARE(flow.target->isTransitioning(), false);
}

void tst_ScreenHost::aScreenArrivesByItself()
{
    ScreenFlow flow(messages());
    flow.host()->setProperty("duration", 30);
    flow.start();

    flow.request("Radio");

    QTRY_COMPARE(flow.screensThere(), QStringList({"radio+"}));
    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Home Radio", "activeViewChanged Radio Home",
                          "viewAnimationStarted Radio 1", "viewActivated Home Radio"}));
}

void tst_ScreenHost::aViewThatIsLeftBeforeItIsShownIsNotReported()
{
    ScreenFlow flow(messages());
    flow.start();

    flow.request("Radio");
    moveHalfway(flow.host());
    flow.request("Map");
    finishMoves(flow.host());
    settle();

    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Home Radio", "activeViewChanged Radio Home",
                          "viewAnimationStarted Radio 1", "viewAboutToBeActivated Radio Map",
                          "activeViewChanged Map Radio", "viewAnimationStarted Map 1",
                          "viewActivated Radio Map"}));
    QCOMPARE(flow.screensThere(), QStringList({"map+"}));
}

void tst_ScreenHost::theSameViewAgainStaysAndIsReported()
{
    ScreenFlow flow(messages());
    new HmiViewState("Home", "HomeAgain", flow.screens);
    flow.start();
    const QQuickItem *home = flow.item("home");

    flow.request("HomeAgain");

    QCOMPARE(flow.item("home"), home);
    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Home Home", "viewActivated Home Home"}));
    QCOMPARE(flow.target->isTransitioning(), false);
}

void tst_ScreenHost::theSameViewAgainWhileItMovesInIsReportedOnce()
{
    ScreenFlow flow(messages());
    new HmiViewState("Radio", "RadioAgain", flow.screens);
    flow.start();
    flow.request("Radio");
    flow.take();

    flow.request("RadioAgain");
    QCOMPARE(flow.take(), QStringList({"viewAboutToBeActivated Radio Radio"}));

    finishMoves(flow.host());
    QCOMPARE(flow.take(), QStringList({"viewActivated Radio Radio"}));
}

void tst_ScreenHost::aScreenThatLeavesTakesNoInput()
{
    ScreenFlow flow(messages(), R"(
        ScreenHost {
            duration: 3600000
            effect: ScreenHost.NoEffect
            property int clicks: 0
            ViewComponent {
                viewId: "Home"
                MouseArea { objectName: "home"; onClicked: ++clicks }
            }
            ViewComponent { viewId: "Radio"; Item { objectName: "radio" } }
        })");
    flow.start();
    flow.scene->window.show();
    QVERIFY(QTest::qWaitForWindowExposed(&flow.scene->window));
    QTest::mouseClick(&flow.scene->window, Qt::LeftButton, Qt::NoModifier, QPoint(200, 150));
    QCOMPARE(flow.host()->property("clicks"), QVariant(1));

    flow.request("Radio");
    QTest::mouseClick(&flow.scene->window, Qt::LeftButton, Qt::NoModifier, QPoint(200, 150));

    QCOMPARE(flow.host()->property("clicks"), QVariant(1));
    QCOMPARE(flow.item("home")->isEnabled(), false);
    QCOMPARE(flow.item("radio")->isEnabled(), true);
}

void tst_ScreenHost::screensFollowTheSizeOfTheHost()
{
    ScreenFlow flow(messages());
    flow.host()->setProperty("keep", 1);
    flow.start();
    flow.request("Radio");

    flow.host()->setSize(QSizeF(800, 480));
    QCOMPARE(flow.item("radio")->size(), QSizeF(800, 480));
    QCOMPARE(flow.item("radio")->x(), 800 * positionOf(flow.item("radio")));
    QCOMPARE(flow.item("home")->size(), QSizeF(800, 480));

    finishMoves(flow.host());
    flow.host()->setSize(QSizeF(640, 400));
    QCOMPARE(flow.item("home")->size(), QSizeF(640, 400));
}

void tst_ScreenHost::aSceneIsInTransitionWhileAScreenMoves()
{
    ScreenFlow flow(messages());
    flow.start();
    QSignalSpy spy(flow.target.get(), &QuickViewStateTarget::transitioningChanged);
    QVERIFY(spy.isValid());

    flow.request("Radio");
    QCOMPARE(flow.target->isTransitioning(), true);
    QCOMPARE(flow.host()->isBusy(), true);

    finishMoves(flow.host());
    QCOMPARE(flow.target->isTransitioning(), false);
    QCOMPARE(flow.host()->isBusy(), false);
    QCOMPARE(spy.size(), 2);
}

void tst_ScreenHost::screensThatWereLeftAreKept_data()
{
    QTest::addColumn<int>("keep");
    QTest::addColumn<QStringList>("there");

    QTest::newRow("none") << 0 << QStringList{"seats+"};
    QTest::newRow("the last two") << 2 << QStringList{"map", "radio", "seats+"};
    QTest::newRow("all") << -1 << QStringList{"home", "map", "radio", "seats+"};
}

void tst_ScreenHost::screensThatWereLeftAreKept()
{
    QFETCH(int, keep);
    ScreenFlow flow(messages(), threeScreens.left(threeScreens.lastIndexOf('}')) + R"(
        ViewComponent { viewId: "Seats"; Item { objectName: "seats" } }
    })");
    flow.view("Seats");
    flow.host()->setProperty("keep", keep);
    flow.start();

    for (const char *view : {"Map", "Radio", "Map", "Seats"}) {
        flow.go(view);
    }

    QTEST(flow.screensThere(), "there");
}

void tst_ScreenHost::aKeptScreenIsAsItWasLeft()
{
    ScreenFlow flow(messages());
    flow.host()->setProperty("keep", 1);
    flow.start();
    flow.go("Radio");
    QQuickItem *radio = flow.item("radio");
    radio->setProperty("typed", 42);

    flow.go("Home");
    QCOMPARE(radio->isVisible(), false);
    flow.go("Radio");

    QCOMPARE(flow.item("radio"), radio);
    QCOMPARE(radio->property("typed"), QVariant(42));
    QCOMPARE(radio->isVisible(), true);
    QCOMPARE(radio->isEnabled(), true);
    QCOMPARE(radio->x(), 0.0);
}

void tst_ScreenHost::aKeptScreenGetsTheDataOfTheNewActivation()
{
    ScreenFlow flow(messages(), R"(
        ScreenHost {
            duration: 0
            keep: 1
            ViewComponent { viewId: "Home"; Item { } }
            ViewComponent { viewId: "Radio"; Item { objectName: "radio"; property var viewData } }
        })");
    flow.start();
    flow.request("Radio", "94.7");
    flow.request("Home");

    flow.request("Radio", "101.1");

    QCOMPARE(flow.item("radio")->property("viewData").toMap().value("eventData"),
             QVariant("101.1"));
}

void tst_ScreenHost::keepingFewerDropsTheOldest()
{
    ScreenFlow flow(messages());
    flow.host()->setProperty("keep", -1);
    flow.start();
    flow.go("Radio");
    flow.go("Map");
    QSignalSpy spy(flow.host(), &ScreenHost::keepChanged);
    QVERIFY(spy.isValid());

    flow.host()->setKeep(1);
    flow.host()->setKeep(1);
    settle();

    QCOMPARE(flow.screensThere(), QStringList({"map+", "radio"}));
    QCOMPARE(spy.size(), 1);
}

void tst_ScreenHost::loadingMayTakeItsTime()
{
    ScreenFlow flow(messages());
    StepwiseIncubation incubation(flow.scene->engine);
    flow.start();
    flow.host()->setProperty("asynchronous", true);

    flow.request("Radio");
    QCOMPARE(flow.screensThere(), QStringList({"home+"}));
    QCOMPARE(flow.item("home")->isEnabled(), true);
    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Home Radio", "activeViewChanged Radio Home"}));
    QCOMPARE(flow.target->isTransitioning(), true);

    incubation.finish();
    QCOMPARE(flow.take(), QStringList({"viewAnimationStarted Radio 1"}));
    finishMoves(flow.host());
    QCOMPARE(flow.take(), QStringList({"viewActivated Home Radio"}));
    QCOMPARE(flow.target->isTransitioning(), false);
}

void tst_ScreenHost::aViewThatIsLeftWhileItLoadsIsNeverShown()
{
    ScreenFlow flow(messages());
    StepwiseIncubation incubation(flow.scene->engine);
    flow.start();
    flow.host()->setProperty("asynchronous", true);

    flow.request("Radio");
    flow.request("Map");
    incubation.finish();
    finishMoves(flow.host());
    settle();
    QCOMPARE(flow.screensThere(), QStringList({"map+"}));
    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Home Radio", "activeViewChanged Radio Home",
                          "viewAboutToBeActivated Radio Map", "activeViewChanged Map Radio",
                          "viewAnimationStarted Map 1", "viewActivated Radio Map"}));

    flow.request("Radio");
    flow.request("Map"); // back to what is shown still
    incubation.finish();
    QCOMPARE(flow.screensThere(), QStringList({"map+"}));
    QCOMPARE(flow.take().last(), QString("viewActivated Radio Map"));
    QCOMPARE(flow.target->isTransitioning(), false);
}

void tst_ScreenHost::aFileMayBeLoadedBesideTheScene()
{
    Files files;
    QVERIFY(files.write("Home.qml", "import QtQuick 2.15\nItem { objectName: 'home' }"));
    ScreenFlow flow(messages(), "ScreenHost { source: '%1.qml'; asynchronous: true }",
                    files.url("Scene.qml"));

    flow.start();
    QCOMPARE(flow.target->isTransitioning(), true);

    QTRY_COMPARE(flow.screensThere(), QStringList({"home+"}));
    QCOMPARE(flow.take(), QStringList({"viewActivated none Home"}));
}

void tst_ScreenHost::whatCannotBeLoadedIsShownAndReported_data()
{
    QTest::addColumn<QByteArray>("radio");
    QTest::addColumn<QString>("file");
    QTest::addColumn<int>("line");
    QTest::addColumn<QString>("text");

    QTest::newRow("a syntax error") << QByteArray("import QtQuick 2.15\nItem {\n    x: 1 +\n}")
                                    << "Radio.qml" << 4 << "Expected token `numeric literal'";
    QTest::newRow("an unknown type") << QByteArray("import QtQuick 2.15\nItem {\n    Dial { }\n}")
                                     << "Radio.qml" << 3 << "Dial is not a type";
    QTest::newRow("a fault in a file that it uses")
        << QByteArray("import QtQuick 2.15\nItem {\n    Broken { }\n}") << "Broken.qml" << 2
        << "Cannot assign to non-existent property \"wdth\"";
    QTest::newRow("a root that is no item") << QByteArray("import QtQml 2.15\nQtObject { }")
                                            << "Radio.qml" << 1 << "the root is no Item";
    QTest::newRow("no file") << QByteArray() << "Radio.qml" << -1 << "No such file or directory";
}

void tst_ScreenHost::whatCannotBeLoadedIsShownAndReported()
{
    QFETCH(QByteArray, radio);
    QFETCH(QString, file);
    QFETCH(int, line);
    QFETCH(QString, text);
    Files files;
    QVERIFY(files.write("Home.qml", "import QtQuick 2.15\nItem { objectName: 'home' }"));
    QVERIFY(files.write("Broken.qml", "import QtQuick 2.15\nItem { wdth: 1 }"));
    QVERIFY(radio.isEmpty() || files.write("Radio.qml", radio));
    ScreenFlow flow(messages(), "ScreenHost { source: '%1.qml'; duration: 3600000 }",
                    files.url("Scene.qml"));
    flow.start();
    QSignalSpy failed(flow.target.get(), &QuickViewStateTarget::loadFailed);
    QVERIFY(failed.isValid());

    flow.request("Radio");
    finishMoves(flow.host());
    settle();

    const QString url = files.url(file).toString();
    const QString place = line < 0 ? url : url + ':' + QString::number(line);
    QCOMPARE(failed, QList<QVariantList>({{"Radio", files.url(file), line, text}}));
    QCOMPARE(flow.takeMessages(),
             QStringList({"\"Radio\" cannot be shown: " + place + ": " + text}));
    QCOMPARE(flow.screensThere(), QStringList({"errorCard+"}));
    const QQuickItem *card = flow.item("errorCard");
    QCOMPARE(card->size(), QSizeF(400, 300));
    QCOMPARE(textIn(card, "errorTitle"), QString::fromUtf8("“Radio” cannot be shown"));
    QCOMPARE(textIn(card, "errorPlace"), place);
    QCOMPARE(textIn(card, "errorText"), text);
    QCOMPARE(flow.activeView(), QString("Radio"));
    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Home Radio", "activeViewChanged Radio Home"}));
}

void tst_ScreenHost::aViewWithoutAComponentIsReported()
{
    ScreenFlow flow(messages(), R"(
        ScreenHost { duration: 0; ViewComponent { viewId: "Home"; Item { } } })");
    flow.start();
    QSignalSpy failed(flow.target.get(), &QuickViewStateTarget::loadFailed);
    QVERIFY(failed.isValid());

    flow.request("Radio");

    QCOMPARE(failed, QList<QVariantList>({{"Radio", QUrl(), -1, "there is no component for it"}}));
    QCOMPARE(flow.takeMessages(),
             QStringList({"\"Radio\" cannot be shown: there is no component for it"}));
    QCOMPARE(textIn(flow.item("errorCard"), "errorPlace"), QString());
    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Home Radio", "activeViewChanged Radio Home"}));
}

void tst_ScreenHost::anotherViewWorksAfterAFailure()
{
    ScreenFlow flow(messages(), R"(
        ScreenHost {
            duration: 3600000
            keep: -1
            ViewComponent { viewId: "Home"; Item { objectName: "home" } }
            ViewComponent { viewId: "Map"; Item { objectName: "map" } }
        })");
    flow.start();
    flow.request("Radio");
    QCOMPARE(flow.takeMessages().size(), 1);
    flow.take();

    flow.go("Map");

    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Radio Map", "activeViewChanged Map Radio",
                          "viewAnimationStarted Map 1", "viewActivated Radio Map"}));
    QCOMPARE(flow.screensThere(), QStringList({"home", "map+"}));
}

void tst_ScreenHost::aFailedViewIsTriedAgain()
{
    Files files;
    QVERIFY(files.write("Home.qml", "import QtQuick 2.15\nItem { objectName: 'home' }"));
    ScreenFlow flow(messages(), "ScreenHost { source: '%1.qml'; duration: 0 }",
                    files.url("Scene.qml"));
    new HmiViewState("Radio", "RadioAgain", flow.screens);
    flow.start();
    flow.request("Radio");
    QCOMPARE(flow.takeMessages().size(), 1);
    QVERIFY(files.write("Radio.qml", "import QtQuick 2.15\nItem { objectName: 'radio' }"));
    flow.scene->engine.clearComponentCache();

    flow.request("RadioAgain");

    QCOMPARE(flow.screensThere(), QStringList({"radio+"}));
    QCOMPARE(flow.take().last(), QString("viewActivated Radio Radio"));
}

void tst_ScreenHost::theErrorItemMayBeAnother()
{
    ScreenFlow flow(messages(), R"(
        ScreenHost {
            duration: 0
            ViewComponent { viewId: "Home"; Item { } }
            errorComponent: Item {
                objectName: "own"
                property string failedId
                property url file: "unset"
                property int line
                property string text
            }
        })");
    flow.start();

    flow.request("Radio");

    QCOMPARE(flow.takeMessages().size(), 1);
    const QQuickItem *own = flow.item("own");
    QVERIFY(own);
    QCOMPARE(own->property("failedId"), QVariant("Radio"));
    QCOMPARE(own->property("file"), QVariant(QUrl()));
    QCOMPARE(own->property("line"), QVariant(-1));
    QCOMPARE(own->property("text"), QVariant("there is no component for it"));
}

void tst_ScreenHost::anErrorItemWithFaultsIsReportedToo()
{
    ScreenFlow flow(messages(), R"(
        ScreenHost { duration: 0; errorComponent: QtObject { } })");

    flow.start();

    const QStringList warnings = flow.takeMessages();
    QCOMPARE(warnings.size(), 2);
    QCOMPARE(warnings.first(), QString("\"Home\" cannot be shown: there is no component for it"));
    QVERIFY(warnings.last().startsWith("no error item:"));
    QVERIFY(flow.host()->currentItem());
}

void tst_ScreenHost::warningsAreShownAndGo()
{
    ScreenFlow flow(messages());
    flow.start();

    Q_EMIT flow.target->requests()->warned("first");
    Q_EMIT flow.target->requests()->warned("second");
    QCOMPARE(flow.screensThere(), QStringList({"home+", "warningBanner+"}));
    const QQuickItem *banner = flow.item("warningBanner");
    QCOMPARE(banner->property("text"), QVariant("second"));
    QVERIFY(banner->z() > flow.item("home")->z());
    QCOMPARE(banner->width(), 400.0);

    QTRY_COMPARE_WITH_TIMEOUT(flow.screensThere(), QStringList({"home+"}), 20000);
}

void tst_ScreenHost::aLateHostShowsTheActiveView()
{
    QuickFlow flow(messages());
    flow.view("Radio");
    flow.start();
    flow.request("Radio", "94.7");
    flow.take();

    Scene scene(R"(
        ScreenHost {
            ViewComponent { viewId: "Radio"; Item { objectName: "radio"; property var viewData } }
        })");

    const QQuickItem *radio = itemIn(scene.root(), "radio");
    QVERIFY(radio);
    QCOMPARE(radio->property("viewData").toMap().value("eventData"), QVariant("94.7"));
    QCOMPARE(flow.take(), QStringList());
}

void tst_ScreenHost::withoutItsHostTheTargetReportsAtOnce()
{
    ScreenFlow flow(messages());
    flow.start();

    flow.scene->clear();
    flow.request("Radio");

    QCOMPARE(flow.target->viewPresenter(), nullptr);
    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Home Radio", "activeViewChanged Radio Home",
                          "viewActivated Home Radio"}));
}

void tst_ScreenHost::aHostThatIsDestroyedInAMoveLeavesNothing()
{
    ScreenFlow flow(messages());
    StepwiseIncubation incubation(flow.scene->engine);
    flow.start();
    flow.request("Radio");
    flow.host()->setProperty("asynchronous", true);
    flow.request("Map"); // loads still
    QCOMPARE(flow.target->isTransitioning(), true);

    flow.scene->clear();
    settle();

    QCOMPARE(flow.target->isTransitioning(), false);
    flow.take();
    flow.request("Home");
    QCOMPARE(flow.take().last(), QString("viewActivated Map Home"));
}

void tst_ScreenHost::aHostOutlivesItsTarget_data()
{
    QTest::addColumn<bool>("asynchronous");

    QTest::newRow("while a screen moves") << false;
    QTest::newRow("while a screen is loaded") << true;
}

void tst_ScreenHost::aHostOutlivesItsTarget()
{
    QFETCH(bool, asynchronous);
    ScreenFlow flow(messages());
    StepwiseIncubation incubation(flow.scene->engine);
    flow.start();
    flow.host()->setProperty("asynchronous", asynchronous);
    flow.request("Radio");

    flow.target.reset();
    incubation.finish();
    finishMoves(flow.host());
    settle();
    flow.host()->setSize(QSizeF(800, 480));
    flow.host()->setKeep(1);

    QCOMPARE(flow.host()->target(), nullptr);
}

void tst_ScreenHost::aHostMayShowAnotherTarget()
{
    ScreenFlow flow(messages());
    flow.start();
    QuickViewStateTarget other;
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = flow.target.get();
    QSignalSpy spy(flow.host(), &SceneHost::targetChanged);
    QVERIFY(spy.isValid());

    flow.host()->setTarget(&other);
    flow.host()->setTarget(&other);
    QCOMPARE(spy.size(), 1);
    QCOMPARE(flow.target->viewPresenter(), nullptr);
    QCOMPARE(other.viewPresenter(), flow.host());

    other.activateView("Radio", QVariantMap());
    finishMoves(flow.host());
    settle();
    QCOMPARE(flow.screensThere(), QStringList({"radio+"}));

    flow.host()->setTarget(nullptr);
    QCOMPARE(other.viewPresenter(), nullptr);
}

QTEST_MAIN(tst_ScreenHost)
#include "tst_screenhost.moc"
