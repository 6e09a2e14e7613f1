#include "childprocess.h"
#include "driving.h"
#include "librarytest.h"
#include "quickflow.h"
#include "scene.h"

#include <HmiStateMachineQuick/requests.h>

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QProcess>
#include <QQmlComponent>
#include <QQmlContext>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

constexpr int viewerTimeoutMs = 20000;

const QString noTarget = "There is no QuickViewStateTarget: make one before the scene is loaded.";

QString errorOf(const QByteArray &qml)
{
    QQmlEngine engine;
    QQmlComponent component(&engine);
    component.setData("import QtQuick 2.15\nimport HmiStateMachine 1.0\n" + qml,
                      QUrl("file:///scene/Scene.qml"));
    return component.isError() ? component.errors().first().description() : QString();
}

} // namespace

class tst_QmlModule : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void theModuleIsUnknownBeforeThereIsATarget();
    void aTargetMakesItKnownWithoutAnImportPath();
    void whatItHasIsReachable_data();
    void whatItHasIsReachable();
    void whatBelongsToTheTargetIsNotMade_data();
    void whatBelongsToTheTargetIsNotMade();
    void theSingletonsAreThoseOfTheTarget();
    void theTargetOutlivesTheEngine();
    void aSceneBindsToTheTarget();
    void popupsAreAModelForViews();
    void withoutATargetASceneGetsAnIdleOne();
    void aViewerFindsThePlugin();
};

void tst_QmlModule::theModuleIsUnknownBeforeThereIsATarget()
{
    if (!isChildProcess()) { // what is known to a process stays so
        const ChildResult result = runAsChild("theModuleIsUnknownBeforeThereIsATarget");
        QVERIFY2(result.exitCode == 0, qPrintable(result.output));
        return;
    }
    QCOMPARE(errorOf("ScreenHost { }"), QString("module \"HmiStateMachine\" is not installed"));
}

void tst_QmlModule::aTargetMakesItKnownWithoutAnImportPath()
{
    QuickViewStateTarget target;

    QCOMPARE(errorOf("ScreenHost { }"), QString());
}

void tst_QmlModule::whatItHasIsReachable_data()
{
    QTest::addColumn<QString>("expression");
    QTest::addColumn<QVariant>("value");

    QTest::newRow("forwards") << "ViewTarget.ForwardAnimation" << QVariant(1);
    QTest::newRow("back") << "ViewTarget.BackAnimation" << QVariant(2);
    QTest::newRow("appears") << "ViewTarget.AppearAnimation" << QVariant(1);
    QTest::newRow("disappears") << "ViewTarget.DisappearAnimation" << QVariant(2);
    QTest::newRow("no effect") << "ScreenHost.NoEffect" << QVariant(0);
    QTest::newRow("fade") << "PopupHost.Fade" << QVariant(1);
    QTest::newRow("slide") << "SceneHost.Slide" << QVariant(2);
    QTest::newRow("role") << "PopupListModel.CoveredRole" << QVariant(263);
    QTest::newRow("screen's place") << "ScreenHost.position" << QVariant(0);
    QTest::newRow("popup's place") << "PopupHost.position" << QVariant(0);
    QTest::newRow("requests") << "Requests === ViewTarget.requests" << QVariant(true);
}

void tst_QmlModule::whatItHasIsReachable()
{
    QFETCH(QString, expression);
    QuickViewStateTarget target;

    Scene scene("Item { property var value: " + expression.toUtf8() + " }");

    QTEST(scene.root()->property("value"), "value");
}

void tst_QmlModule::whatBelongsToTheTargetIsNotMade_data()
{
    QTest::addColumn<QByteArray>("qml");
    QTest::addColumn<QString>("error");

    QTest::newRow("a list of popups")
        << QByteArray("PopupListModel { }") << "belongs to ViewTarget";
    QTest::newRow("the base of hosts")
        << QByteArray("SceneHost { }") << "is the base of ScreenHost and PopupHost";
    QTest::newRow("requests") << QByteArray("Requests { }") << "Element is not creatable.";
}

void tst_QmlModule::whatBelongsToTheTargetIsNotMade()
{
    QFETCH(QByteArray, qml);
    QuickViewStateTarget target;

    QTEST(errorOf(qml), "error");
}

void tst_QmlModule::theSingletonsAreThoseOfTheTarget()
{
    QuickViewStateTarget target;

    Scene scene("Item { property var first: ViewTarget; property var second: Requests }");

    QCOMPARE(scene.root()->property("first").value<QObject *>(), &target);
    QCOMPARE(scene.root()->property("second").value<QObject *>(), target.requests());
}

void tst_QmlModule::theTargetOutlivesTheEngine()
{
    QPointer<QuickViewStateTarget> target = new QuickViewStateTarget;
    {
        Scene scene("Item { property var first: ViewTarget; property var second: Requests }");
        scene.engine.collectGarbage();
    }
    settle();

    QVERIFY(target);
    QVERIFY(target->requests());
    delete target;
}

void tst_QmlModule::aSceneBindsToTheTarget()
{
    QuickFlow flow(messages());
    flow.view("Media/Player");
    Scene scene(R"(
        Item {
            property string text: [ViewTarget.activeView, ViewTarget.activeDomainName,
                                   ViewTarget.activeDomain, ViewTarget.viewData.eventData,
                                   ViewTarget.activationData, ViewTarget.backTarget,
                                   ViewTarget.backPossible].join(" ")
            property var seen: []
            Connections {
                target: ViewTarget
                function onViewActivated(oldViewId, newViewId) { seen.push(newViewId) }
            }
        })");
    flow.target->setDomains({"Home", "Media"});
    flow.home->setActivationData("welcome");
    flow.start();
    QCOMPARE(scene.root()->property("text"), QVariant("Home Home 0  welcome  false"));

    flow.request("Media/Player", "song");

    QCOMPARE(scene.root()->property("text"), QVariant("Media/Player Media 1 song  Home true"));
    QCOMPARE(scene.root()->property("seen").toStringList(), QStringList({"Home", "Media/Player"}));
}

void tst_QmlModule::popupsAreAModelForViews()
{
    QuickFlow flow(messages());
    flow.popup("car/fuel", "FuelView", 4);
    flow.overlayPopup("phone/call", "CallView", 7);
    Scene scene(R"(
        Item {
            property int count: ViewTarget.shownPopups.count
            Repeater {
                model: ViewTarget.shownPopups
                Item {
                    // An item has a layer of its own.
                    objectName: [popupId, kind, model.layer, covered, popupData.eventData].join(" ")
                }
            }
        })");
    flow.start();

    flow.requestPopup("car/fuel", "low");
    flow.requestPopup("phone/call", "ringing");

    QCOMPARE(scene.root()->property("count"), QVariant(2));
    QVERIFY(itemIn(scene.root(), "FuelView 4 Screens false low"));
    QVERIFY(itemIn(scene.root(), "CallView 7 Overlay false ringing"));
}

void tst_QmlModule::withoutATargetASceneGetsAnIdleOne()
{
    QuickViewStateTarget::registerQmlModule();
    Scene scene("Item { property var first: ViewTarget; property var second: Requests }");

    const auto *idle = scene.root()->property("first").value<QuickViewStateTarget *>();
    QVERIFY(idle);
    QCOMPARE(scene.root()->property("second").value<QObject *>(), idle->requests());
    QCOMPARE(ViewStateTarget::instance(), nullptr);
    const auto written = messages().takeMessages();
    QCOMPARE(written.size(), 1);
    QCOMPARE(written.first().text, noTarget);
}

void tst_QmlModule::aViewerFindsThePlugin()
{
    Files files;
    QVERIFY(files.write("Scene.qml", R"(
import QtQuick 2.15
import HmiStateMachine 1.0

Item {
    property string result: "view [" + ViewTarget.activeView + "], effect " + host.effect
    ScreenHost { id: host; ViewComponent { viewId: "Home"; Item { } } }
    PopupHost { PopupComponent { kind: 1; Item { } } }
}
)"));
    QProcess viewer;
    viewer.start(HMI_QUICK_VIEWER, {HMI_QML_DIR, files.url("Scene.qml").toLocalFile()});
    QVERIFY(viewer.waitForFinished(viewerTimeoutMs));

    const QString errors = QString::fromLocal8Bit(viewer.readAllStandardError());
    QVERIFY2(viewer.exitStatus() == QProcess::NormalExit && viewer.exitCode() == 0,
             qPrintable(errors));
    QCOMPARE(QString::fromLocal8Bit(viewer.readAllStandardOutput()),
             QString("view [], effect 2\n"));
    QVERIFY2(errors.contains(noTarget), qPrintable(errors));
}

QTEST_MAIN(tst_QmlModule)
#include "tst_qmlmodule.moc"
