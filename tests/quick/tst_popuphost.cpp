#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"
#include "quickflow.h"
#include "scene.h"

#include <HmiStateMachineQuick/hostattached.h>
#include <HmiStateMachineQuick/popupcomponent.h>
#include <HmiStateMachineQuick/popuphost.h>

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QTimer>
#include <QtTest>
#include <QVariantAnimation>

using namespace HmiStateMachine;

namespace {

// Moves of an hour end when the test says so.
const QByteArray popupsByName = R"(
PopupHost {
    duration: 3600000
    easing.type: Easing.Linear
    PopupComponent { popupId: "FuelView"; Item { objectName: "fuel" } }
    PopupComponent { popupId: "OilView"; Item { objectName: "oil" } }
    PopupComponent { popupId: "CallView"; Item { objectName: "call" } }
})";

/**
 * A flow with the popups "fuel" and "oil" of the screens and "call" of the layer above, over a
 * scene. Rules are kept as long as the process lives, so each function has a module of its own.
 */
struct PopupScene : QuickFlow
{
    explicit PopupScene(MessageRecorder &messages, const QString &module,
                        const QByteArray &qml = popupsByName,
                        const QUrl &url = QUrl("file:///scene/Scene.qml"))
        : QuickFlow(messages), fuel(popup(module + "/fuel", "FuelView", 4)),
          oil(popup(module + "/oil", "OilView", 4)),
          call(overlayPopup(module + "/call", "CallView", 7)),
          scene(std::make_unique<Scene>(qml, url))
    {
    }

    void request(PopupState *popup, const QVariant &data = QVariant())
    {
        requestPopup(popup->name(), data);
    }

    void close(PopupState *popup) { dismiss(popup->name()); }

    PopupHost *host() const
    {
        auto *root = qobject_cast<PopupHost *>(scene->root());
        return root ? root : scene->root()->findChild<PopupHost *>();
    }

    QQuickItem *item(const QString &objectName) const { return itemIn(host(), objectName); }

    /** The names of the items from the lowest, the visible ones with "+". */
    QStringList itemsThere() const
    {
        QList<QQuickItem *> items = host()->childItems();
        std::stable_sort(
            items.begin(), items.end(),
            [](const QQuickItem *left, const QQuickItem *right) { return left->z() < right->z(); });
        QStringList names;
        for (const QQuickItem *child : qAsConst(items)) {
            names.append(child->objectName() + (child->isVisible() ? "+" : ""));
        }
        return names;
    }

    void finish() const
    {
        finishMoves(host());
        settle();
    }

    PopupState *const fuel;
    PopupState *const oil;
    PopupState *const call;
    std::unique_ptr<Scene> scene;
};

void rule(PopupState *front, PopupState::InterruptionBehavior answer, PopupState *requested)
{
    PopupInterruptionStore::instance()->insertInterruptionBehavior(answer, front->name(),
                                                                   requested->name());
}

qreal positionOf(QQuickItem *item)
{
    return qobject_cast<HostAttached *>(qmlAttachedPropertiesObject<PopupHost>(item))->position();
}

QTimer *timerOf(const PopupState *popup)
{
    return popup->findChild<QTimer *>(QString(), Qt::FindDirectChildrenOnly);
}

} // namespace

class tst_PopupHost : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectsAreAsPublished();
    void itsSettingsAtFirst();

    void aComponentIsFoundByIdThenByKindThenByThePattern();
    void theFirstComponentOfAKindServesIt();
    void aPopupGetsThePropertiesThatItDeclares();
    void thePropertiesAreKeptUpToDate();
    void theRemainingTimeIsKeptUpToDate();

    void aPopupIsReportedWhenItBeginsToAppear();
    void aPopupFadesAndGrowsAsItAppears();
    void slidingPopupsComeFromAbove();
    void withoutAnEffectOnlyThePositionMoves();
    void aPopupIsReportedHiddenOnceItHasGone();
    void withoutADurationAPopupComesAndGoesAtOnce();
    void aPopupComesAndGoesByItself();
    void newDataDoesNotHoldAMoveUp();
    void popupsFollowTheSizeOfTheHost();
    void aSceneIsInTransitionWhileAPopupMoves();

    void thePopupShownLastIsOnTop();
    void aPopupThatIsShownAgainComesToTheTop();
    void aCoveredPopupFadesOutAndReturns();
    void oneOfALayerIsShown();
    void aPopupThatIsDismissedWhileCoveredGoes();
    void aPopupThatLeavesTakesNoInput();

    void aPopupThatIsShownAgainWhileItLeavesTurnsRound();
    void aPopupThatIsHiddenAndShownAtOnceStays();
    void aPopupThatIsWithdrawnWhileItLoadsIsNeverShown();
    void aPopupIsReportedWhenItIsLoaded();
    void aPopupThatIsCoveredWhileItLoadsStaysOut();
    void theTimeRunsFromWhenThePopupIsShown();
    void suppressedLayersAreNotDrawn();
    void layersMayBeSuppressedFromTheBeginning();

    void aPopupThatCannotBeLoadedIsReportedAndShown();
    void anotherErrorItemIsTold();
    void aLateHostShowsWhatIsShown();
    void withoutItsHostTheTargetReportsAtOnce();
    void aHostOutlivesItsTarget_data();
    void aHostOutlivesItsTarget();
    void aHostMayShowAnotherTarget();
};

void tst_PopupHost::itsMetaObjectsAreAsPublished()
{
    QCOMPARE(metaDescription(PopupHost::staticMetaObject),
             QStringList({"signal suppressedLayersChanged()", "signal topItemChanged()",
                          "property QStringList suppressedLayers read write "
                          "suppressedLayersChanged()",
                          "property QQuickItem* topItem read topItemChanged()"}));
    QCOMPARE(PopupHost::staticMetaObject.superClass(), &SceneHost::staticMetaObject);
    QCOMPARE(metaDescription(PopupComponent::staticMetaObject),
             QStringList({"signal popupIdChanged()", "signal kindChanged()",
                          "property QString popupId read write popupIdChanged()",
                          "property int kind read write kindChanged()"}));
    QCOMPARE(PopupComponent::staticMetaObject.superClass(), &HostedComponent::staticMetaObject);
}

void tst_PopupHost::itsSettingsAtFirst()
{
    QuickFlow flow(messages());
    Scene scene("PopupHost { PopupComponent { objectName: 'component' } }");
    const auto *host = qobject_cast<PopupHost *>(scene.root());

    QCOMPARE(host->target(), flow.target.get());
    QCOMPARE(host->effect(), SceneHost::Fade);
    QCOMPARE(host->duration(), 250);
    QCOMPARE(host->suppressedLayers(), QStringList());
    QCOMPARE(host->topItem(), nullptr);
    const auto *component = host->findChild<PopupComponent *>("component");
    QCOMPARE(component->popupId(), QString());
    QCOMPARE(component->kind(), -1);
}

void tst_PopupHost::aComponentIsFoundByIdThenByKindThenByThePattern()
{
    Files files;
    QVERIFY(files.write("popups/CallView.qml", "import QtQuick 2.15\nItem { objectName: 'file' }"));
    PopupScene flow(messages(), "find", R"(
        PopupHost {
            source: "popups/%1.qml"
            PopupComponent { kind: 4; Item { objectName: "kind" } }
            PopupComponent { popupId: "FuelView"; kind: 7; Item { objectName: "id" } }
        })",
                    files.url("Scene.qml"));
    flow.start();

    flow.request(flow.fuel);
    QCOMPARE(flow.itemsThere(), QStringList({"id+"}));
    flow.request(flow.call);
    QCOMPARE(flow.itemsThere(), QStringList({"id+", "file+"}));
    flow.close(flow.fuel);
    flow.finish();
    flow.request(flow.oil);
    QCOMPARE(flow.itemsThere(), QStringList({"file+", "kind+"}));
}

void tst_PopupHost::theFirstComponentOfAKindServesIt()
{
    PopupScene flow(messages(), "first", R"(
        PopupHost {
            PopupComponent { kind: 7; Item { objectName: "other" } }
            PopupComponent { kind: 4; Item { objectName: "first" } }
            PopupComponent { kind: 4; Item { objectName: "second" } }
        })");
    flow.start();

    flow.request(flow.fuel);

    QCOMPARE(flow.itemsThere(), QStringList({"first+"}));
}

void tst_PopupHost::aPopupGetsThePropertiesThatItDeclares()
{
    PopupScene flow(messages(), "properties", R"(
        PopupHost {
            PopupComponent {
                popupId: "FuelView"
                Item {
                    objectName: "fuel"
                    property string popupId
                    property int popupKind
                    property var popupData
                    property int totalTime
                    property string atFirst
                    Component.onCompleted: atFirst = popupId
                }
            }
        })");
    flow.fuel->setAutoDismissTimeoutActive(true);
    flow.fuel->setAutoDismissTimeoutInterval(7000);
    flow.start();

    flow.request(flow.fuel, "low");

    const QQuickItem *fuel = flow.item("fuel");
    QCOMPARE(fuel->property("popupId"), QVariant("FuelView"));
    QCOMPARE(fuel->property("popupKind"), QVariant(4));
    QCOMPARE(fuel->property("popupData").toMap(), QVariantMap({{"eventData", "low"}}));
    QCOMPARE(fuel->property("totalTime"), QVariant(7000));
    QCOMPARE(fuel->property("atFirst"), QVariant("FuelView"));
    QCOMPARE(fuel->size(), QSizeF(400, 300));
}

void tst_PopupHost::thePropertiesAreKeptUpToDate()
{
    PopupScene flow(messages(), "update", R"(
        PopupHost {
            PopupComponent { kind: 4; Item { objectName: "fuel"; property var popupData } }
        })");
    flow.start();
    flow.request(flow.fuel, "low");

    flow.request(flow.fuel, "empty");

    QCOMPARE(flow.item("fuel")->property("popupData").toMap(),
             QVariantMap({{"eventData", "empty"}}));
}

void tst_PopupHost::theRemainingTimeIsKeptUpToDate()
{
    PopupScene flow(messages(), "remaining", R"(
        PopupHost {
            PopupComponent { kind: 4; Item { objectName: "fuel"; property int remainingTime } }
        })");
    flow.fuel->setAutoDismissTimeoutActive(true);
    flow.fuel->setAutoDismissTimeoutInterval(7000);
    flow.start();

    flow.request(flow.fuel);
    const int atFirst = flow.item("fuel")->property("remainingTime").toInt();
    QVERIFY(atFirst > 6000 && atFirst < 7400);

    timerOf(flow.fuel)->start(3000);
    QVERIFY(fire(flow.target->findChild<QTimer *>(QString(), Qt::FindDirectChildrenOnly)));
    const int later = flow.item("fuel")->property("remainingTime").toInt();
    QVERIFY(later > 2000 && later < 3200);
}

void tst_PopupHost::aPopupIsReportedWhenItBeginsToAppear()
{
    PopupScene flow(messages(), "appear");
    QSignalSpy top(flow.host(), &PopupHost::topItemChanged);
    QVERIFY(top.isValid());
    flow.start();

    flow.request(flow.fuel);

    QCOMPARE(flow.take(),
             QStringList({"popupAnimationStarted FuelView 1", "popupStatusChanged FuelView true"}));
    QCOMPARE(positionOf(flow.item("fuel")), 1.0);
    QCOMPARE(flow.host()->topItem(), flow.item("fuel"));
    QCOMPARE(top.size(), 1);
    flow.finish();
    QCOMPARE(positionOf(flow.item("fuel")), 0.0);
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupHost::aPopupFadesAndGrowsAsItAppears()
{
    PopupScene flow(messages(), "fade");
    flow.start();

    flow.request(flow.fuel);
    const QQuickItem *fuel = flow.item("fuel");
    QCOMPARE(fuel->opacity(), 0.0);
    QCOMPARE(fuel->scale(), 0.92);

    moveHalfway(flow.host());
    QVERIFY(qAbs(fuel->opacity() - 0.5) < 0.01);
    QVERIFY(qAbs(fuel->scale() - 0.96) < 0.01);

    flow.finish();
    QCOMPARE(fuel->opacity(), 1.0);
    QCOMPARE(fuel->scale(), 1.0);
}

void tst_PopupHost::slidingPopupsComeFromAbove()
{
    PopupScene flow(messages(), "slide");
    flow.host()->setProperty("effect", SceneHost::Slide);
    flow.start();

    flow.request(flow.fuel);
    QCOMPARE(flow.item("fuel")->y(), -300.0);
    QCOMPARE(flow.item("fuel")->opacity(), 1.0);

    flow.finish();
    QCOMPARE(flow.item("fuel")->y(), 0.0);
}

void tst_PopupHost::withoutAnEffectOnlyThePositionMoves()
{
    PopupScene flow(messages(), "noeffect", R"(
        PopupHost {
            duration: 3600000
            effect: PopupHost.NoEffect
            PopupComponent { kind: 4; Item { objectName: "fuel"; x: PopupHost.position * 100 } }
        })");
    flow.start();

    flow.request(flow.fuel);
    QCOMPARE(flow.item("fuel")->x(), 100.0);
    QCOMPARE(flow.item("fuel")->opacity(), 1.0);
    QCOMPARE(flow.item("fuel")->y(), 0.0);

    flow.finish();
    QCOMPARE(flow.item("fuel")->x(), 0.0);
}

void tst_PopupHost::aPopupIsReportedHiddenOnceItHasGone()
{
    PopupScene flow(messages(), "hidden");
    flow.start();
    flow.request(flow.fuel);
    flow.finish();
    flow.take();

    flow.close(flow.fuel);
    QCOMPARE(flow.take(), QStringList({"popupAnimationStarted FuelView 2"}));
    QCOMPARE(flow.itemsThere(), QStringList({"fuel+"}));
    QCOMPARE(flow.host()->topItem(), nullptr);

    flow.finish();
    QCOMPARE(flow.take(), QStringList({"popupStatusChanged FuelView false"}));
    QCOMPARE(flow.itemsThere(), QStringList());
}

void tst_PopupHost::withoutADurationAPopupComesAndGoesAtOnce()
{
    PopupScene flow(messages(), "noduration");
    flow.host()->setProperty("duration", 0);
    flow.start();

    flow.request(flow.fuel);
    QCOMPARE(flow.item("fuel")->opacity(), 1.0);
    QCOMPARE(flow.target->isTransitioning(), false);

    flow.close(flow.fuel);
    settle();
    QCOMPARE(flow.itemsThere(), QStringList());
    QCOMPARE(
        flow.take(),
        QStringList({"popupAnimationStarted FuelView 1", "popupStatusChanged FuelView true",
                     "popupAnimationStarted FuelView 2", "popupStatusChanged FuelView false"}));
    QCOMPARE(flow.target->isTransitioning(), false);
}

void tst_PopupHost::aPopupComesAndGoesByItself()
{
    PopupScene flow(messages(), "byitself");
    flow.host()->setProperty("duration", 30);
    flow.start();

    flow.request(flow.fuel);
    QTRY_COMPARE(flow.item("fuel")->opacity(), 1.0);

    flow.close(flow.fuel);
    QTRY_COMPARE(flow.itemsThere(), QStringList());
}

void tst_PopupHost::newDataDoesNotHoldAMoveUp()
{
    PopupScene flow(messages(), "holdup");
    flow.start();
    flow.request(flow.fuel);
    moveHalfway(flow.host());
    const auto *move = flow.host()->findChild<QVariantAnimation *>();
    QVERIFY(move->currentTime() >= 1800000);

    flow.request(flow.fuel, "empty");

    QCOMPARE(move->startValue(), QVariant(1.0));
    QVERIFY(move->currentTime() >= 1800000);
    flow.finish();
    QCOMPARE(flow.target->isTransitioning(), false);
}

void tst_PopupHost::popupsFollowTheSizeOfTheHost()
{
    PopupScene flow(messages(), "size");
    flow.start();
    flow.request(flow.fuel);

    flow.host()->setSize(QSizeF(800, 480));

    QCOMPARE(flow.item("fuel")->size(), QSizeF(800, 480));
}

void tst_PopupHost::aSceneIsInTransitionWhileAPopupMoves()
{
    PopupScene flow(messages(), "transition");
    flow.start();

    flow.request(flow.fuel);
    QCOMPARE(flow.target->isTransitioning(), true);
    flow.finish();
    QCOMPARE(flow.target->isTransitioning(), false);

    flow.close(flow.fuel);
    QCOMPARE(flow.target->isTransitioning(), true);
    flow.finish();
    QCOMPARE(flow.target->isTransitioning(), false);
}

void tst_PopupHost::thePopupShownLastIsOnTop()
{
    PopupScene flow(messages(), "last");
    flow.start();

    flow.request(flow.call);
    flow.request(flow.fuel);
    flow.finish();

    QCOMPARE(flow.itemsThere(), QStringList({"call+", "fuel+"}));
    QCOMPARE(flow.host()->topItem(), flow.item("fuel"));

    flow.close(flow.fuel);
    QCOMPARE(flow.host()->topItem(), flow.item("call"));
}

void tst_PopupHost::aPopupThatIsShownAgainComesToTheTop()
{
    PopupScene flow(messages(), "again");
    flow.start();
    flow.request(flow.fuel);
    flow.request(flow.call);
    flow.finish();
    const QQuickItem *fuel = flow.item("fuel");

    flow.fuel->showPopup(false);

    QCOMPARE(flow.itemsThere(), QStringList({"call+", "fuel+"}));
    QCOMPARE(flow.item("fuel"), fuel);
    QCOMPARE(flow.host()->topItem(), fuel);
}

void tst_PopupHost::aCoveredPopupFadesOutAndReturns()
{
    PopupScene flow(messages(), "cover");
    rule(flow.fuel, PopupState::AllowStack, flow.call);
    flow.start();
    flow.request(flow.fuel);
    flow.finish();
    QQuickItem *fuel = flow.item("fuel");

    flow.request(flow.call);
    QCOMPARE(flow.itemsThere(), QStringList({"fuel+", "call+"}));
    QCOMPARE(fuel->isEnabled(), false);
    QCOMPARE(flow.host()->topItem(), flow.item("call"));
    flow.finish();
    QCOMPARE(flow.itemsThere(), QStringList({"fuel", "call+"}));

    flow.close(flow.call);
    QCOMPARE(flow.itemsThere(), QStringList({"fuel+", "call+"}));
    QCOMPARE(flow.host()->topItem(), fuel);
    QCOMPARE(fuel->isEnabled(), true);
    flow.finish();
    QCOMPARE(flow.itemsThere(), QStringList({"fuel+"}));
    QCOMPARE(flow.item("fuel"), fuel);
    QCOMPARE(fuel->opacity(), 1.0);
}

void tst_PopupHost::oneOfALayerIsShown()
{
    PopupScene flow(messages(), "layer");
    rule(flow.fuel, PopupState::AllowStack, flow.oil);
    flow.start();
    flow.request(flow.fuel);
    flow.finish();
    QQuickItem *fuel = flow.item("fuel");

    flow.request(flow.oil);
    flow.finish();
    QCOMPARE(flow.itemsThere(), QStringList({"fuel", "oil+"}));

    flow.close(flow.oil);
    flow.finish();
    QCOMPARE(flow.itemsThere(), QStringList({"fuel+"}));
    QCOMPARE(flow.item("fuel"), fuel);
    QCOMPARE(fuel->opacity(), 1.0);
}

void tst_PopupHost::aPopupThatIsDismissedWhileCoveredGoes()
{
    PopupScene flow(messages(), "coveredgone");
    rule(flow.fuel, PopupState::AllowStack, flow.call);
    flow.start();
    flow.request(flow.fuel);
    flow.request(flow.call);
    flow.finish();
    flow.take();

    flow.close(flow.fuel);
    flow.finish();

    QCOMPARE(flow.itemsThere(), QStringList({"call+"}));
    QCOMPARE(flow.take().last(), QString("popupStatusChanged FuelView false"));
}

void tst_PopupHost::aPopupThatLeavesTakesNoInput()
{
    PopupScene flow(messages(), "input");
    flow.start();
    flow.request(flow.fuel);
    QCOMPARE(flow.item("fuel")->isEnabled(), true);

    flow.close(flow.fuel);

    QCOMPARE(flow.item("fuel")->isEnabled(), false);
}

void tst_PopupHost::aPopupThatIsShownAgainWhileItLeavesTurnsRound()
{
    PopupScene flow(messages(), "turn");
    flow.start();
    flow.request(flow.fuel);
    flow.finish();
    QQuickItem *fuel = flow.item("fuel");
    flow.close(flow.fuel);
    moveHalfway(flow.host());
    flow.take();

    flow.request(flow.fuel);
    QCOMPARE(flow.take(),
             QStringList({"popupStatusChanged FuelView false", "popupAnimationStarted FuelView 1",
                          "popupStatusChanged FuelView true"}));
    QCOMPARE(flow.item("fuel"), fuel);
    QCOMPARE(fuel->isEnabled(), true);
    QVERIFY(qAbs(positionOf(fuel) - 0.5) < 0.01);

    flow.finish();
    QCOMPARE(flow.itemsThere(), QStringList({"fuel+"}));
    QCOMPARE(fuel->opacity(), 1.0);
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupHost::aPopupThatIsHiddenAndShownAtOnceStays()
{
    PopupScene flow(messages(), "atonce");
    flow.start();
    flow.request(flow.fuel);
    flow.finish();
    QQuickItem *fuel = flow.item("fuel");
    flow.take();

    flow.fuel->hidePopup(false);
    flow.fuel->showPopup(false);
    flow.finish();

    QCOMPARE(flow.take(),
             QStringList({"popupAnimationStarted FuelView 2", "popupStatusChanged FuelView false",
                          "popupStatusChanged FuelView true"}));
    QCOMPARE(flow.itemsThere(), QStringList({"fuel+"}));
    QCOMPARE(flow.item("fuel"), fuel);
    QCOMPARE(fuel->opacity(), 1.0);
    QCOMPARE(flow.target->isTransitioning(), false);

    flow.close(flow.fuel);
    flow.finish();
    QCOMPARE(flow.itemsThere(), QStringList());
}

void tst_PopupHost::aPopupThatIsWithdrawnWhileItLoadsIsNeverShown()
{
    PopupScene flow(messages(), "withdrawn");
    StepwiseIncubation incubation(flow.scene->engine);
    flow.host()->setProperty("asynchronous", true);
    flow.start();

    flow.request(flow.fuel);
    QCOMPARE(flow.target->isTransitioning(), true);
    flow.close(flow.fuel);
    incubation.finish();
    flow.finish();

    QCOMPARE(flow.itemsThere(), QStringList());
    QCOMPARE(flow.take(), QStringList());
    QCOMPARE(flow.target->isTransitioning(), false);
}

void tst_PopupHost::aPopupIsReportedWhenItIsLoaded()
{
    PopupScene flow(messages(), "loaded");
    StepwiseIncubation incubation(flow.scene->engine);
    flow.host()->setProperty("asynchronous", true);
    flow.start();

    flow.request(flow.fuel);
    flow.request(flow.fuel, "empty"); // while it is loaded
    QCOMPARE(flow.take(), QStringList());
    QCOMPARE(flow.host()->topItem(), nullptr);

    incubation.finish();
    QCOMPARE(flow.take(),
             QStringList({"popupAnimationStarted FuelView 1", "popupStatusChanged FuelView true"}));
    QCOMPARE(flow.host()->topItem(), flow.item("fuel"));
}

void tst_PopupHost::aPopupThatIsCoveredWhileItLoadsStaysOut()
{
    PopupScene flow(messages(), "coveredloading");
    rule(flow.fuel, PopupState::AllowStack, flow.call);
    StepwiseIncubation incubation(flow.scene->engine);
    flow.host()->setProperty("asynchronous", true);
    flow.start();

    flow.request(flow.fuel);
    flow.request(flow.call);
    incubation.finish();
    flow.finish();
    QCOMPARE(flow.itemsThere(), QStringList({"fuel", "call+"}));
    QCOMPARE(positionOf(flow.item("fuel")), 1.0);

    flow.close(flow.call);
    flow.finish();
    QCOMPARE(flow.itemsThere(), QStringList({"fuel+"}));
    QCOMPARE(flow.item("fuel")->opacity(), 1.0);
}

void tst_PopupHost::theTimeRunsFromWhenThePopupIsShown()
{
    PopupScene flow(messages(), "time");
    StepwiseIncubation incubation(flow.scene->engine);
    flow.host()->setProperty("asynchronous", true);
    flow.fuel->setAutoDismissTimeoutActive(true);
    flow.start();

    flow.request(flow.fuel);
    QVERIFY(!timerOf(flow.fuel)->isActive());

    incubation.finish();
    QVERIFY(timerOf(flow.fuel)->isActive());

    QVERIFY(fire(timerOf(flow.fuel)));
    settle();
    flow.finish();
    QCOMPARE(flow.itemsThere(), QStringList());
}

void tst_PopupHost::suppressedLayersAreNotDrawn()
{
    PopupScene flow(messages(), "suppressed");
    QSignalSpy spy(flow.host(), &PopupHost::suppressedLayersChanged);
    QVERIFY(spy.isValid());
    flow.start();
    flow.request(flow.call);
    flow.request(flow.fuel);
    flow.finish();
    flow.take();

    flow.host()->setSuppressedLayers({"Screens"});
    flow.host()->setSuppressedLayers({"Screens"});
    QCOMPARE(flow.itemsThere(), QStringList({"call+", "fuel"}));
    QCOMPARE(flow.host()->topItem(), flow.item("call"));
    QCOMPARE(spy.size(), 1);

    flow.host()->setSuppressedLayers({});
    QCOMPARE(flow.itemsThere(), QStringList({"call+", "fuel+"}));
    QCOMPARE(flow.host()->topItem(), flow.item("fuel"));
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupHost::layersMayBeSuppressedFromTheBeginning()
{
    PopupScene flow(messages(), "suppressedfirst", R"(
        PopupHost {
            suppressedLayers: ["Screens"]
            PopupComponent { kind: 4; Item { objectName: "fuel" } }
        })");
    flow.start();

    flow.request(flow.fuel);

    QCOMPARE(flow.itemsThere(), QStringList({"fuel"}));
    QCOMPARE(flow.host()->topItem(), nullptr);
    QCOMPARE(flow.take(),
             QStringList({"popupAnimationStarted FuelView 1", "popupStatusChanged FuelView true"}));
}

void tst_PopupHost::aPopupThatCannotBeLoadedIsReportedAndShown()
{
    Files files;
    QVERIFY(files.write("FuelView.qml", "import QtQuick 2.15\nItem {\n    Gauge { }\n}"));
    PopupScene flow(messages(), "failed", "PopupHost { source: '%1.qml' }", files.url("Scene.qml"));
    flow.start();
    QSignalSpy failed(flow.target.get(), &QuickViewStateTarget::loadFailed);
    QVERIFY(failed.isValid());

    flow.request(flow.fuel, "low");

    const QUrl file = files.url("FuelView.qml");
    QCOMPARE(failed, QList<QVariantList>({{"FuelView", file, 3, "Gauge is not a type"}}));
    QCOMPARE(flow.takeMessages(),
             QStringList(
                 {"\"FuelView\" cannot be shown: " + file.toString() + ":3: Gauge is not a type"}));
    QCOMPARE(flow.itemsThere(), QStringList({"errorCard+"}));
    QCOMPARE(flow.item("errorCard")->property("failedId"), QVariant("FuelView"));
    QCOMPARE(flow.take(),
             QStringList({"popupAnimationStarted FuelView 1", "popupStatusChanged FuelView true"}));

    flow.close(flow.fuel);
    flow.finish();
    QCOMPARE(flow.itemsThere(), QStringList());
    QCOMPARE(
        flow.take(),
        QStringList({"popupAnimationStarted FuelView 2", "popupStatusChanged FuelView false"}));
}

void tst_PopupHost::anotherErrorItemIsTold()
{
    PopupScene flow(messages(), "errorcomponent", R"(
        PopupHost { errorComponent: Item { objectName: "own"; property string text } })");
    flow.start();

    flow.request(flow.fuel);

    QCOMPARE(flow.takeMessages(),
             QStringList({"\"FuelView\" cannot be shown: there is no component for it"}));
    QCOMPARE(flow.itemsThere(), QStringList({"own+"}));
    QCOMPARE(flow.item("own")->property("text"), QVariant("there is no component for it"));
}

void tst_PopupHost::aLateHostShowsWhatIsShown()
{
    QuickFlow flow(messages());
    flow.popup("late/fuel", "FuelView", 4);
    flow.overlayPopup("late/call", "CallView", 7);
    flow.start();
    flow.requestPopup("late/fuel");
    flow.requestPopup("late/call");

    Scene scene(popupsByName);

    QVERIFY(itemIn(scene.root(), "fuel"));
    QVERIFY(itemIn(scene.root(), "call"));
    QCOMPARE(qobject_cast<PopupHost *>(scene.root())->topItem(), itemIn(scene.root(), "call"));
}

void tst_PopupHost::withoutItsHostTheTargetReportsAtOnce()
{
    PopupScene flow(messages(), "destroyed");
    flow.start();
    flow.request(flow.call);

    flow.scene->clear();
    settle();
    QCOMPARE(flow.target->popupPresenter(), nullptr);
    QCOMPARE(flow.target->isTransitioning(), false);
    flow.take();

    flow.request(flow.fuel);
    flow.close(flow.fuel);
    QCOMPARE(
        flow.take(),
        QStringList({"popupStatusChanged FuelView true", "popupStatusChanged FuelView false"}));
}

void tst_PopupHost::aHostOutlivesItsTarget_data()
{
    QTest::addColumn<bool>("asynchronous");

    QTest::newRow("while popups move") << false;
    QTest::newRow("while a popup is loaded") << true;
}

void tst_PopupHost::aHostOutlivesItsTarget()
{
    QFETCH(bool, asynchronous);
    PopupScene flow(messages(), "outlives");
    StepwiseIncubation incubation(flow.scene->engine);
    flow.start();
    flow.request(flow.fuel);
    flow.close(flow.fuel);
    flow.host()->setProperty("asynchronous", asynchronous);
    flow.request(flow.call);

    flow.target.reset();
    incubation.finish();
    flow.finish();
    flow.host()->setSuppressedLayers({"Screens"});

    QCOMPARE(flow.host()->target(), nullptr);
    QCOMPARE(flow.host()->topItem(), nullptr);
    QCOMPARE(flow.itemsThere(), QStringList());
}

void tst_PopupHost::aHostMayShowAnotherTarget()
{
    PopupScene flow(messages(), "another");
    flow.start();
    flow.request(flow.fuel);
    QuickViewStateTarget other;
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = flow.target.get();
    other.requestPopupShow("CallView", 7, QVariant());

    flow.host()->setTarget(&other);
    settle();

    QCOMPARE(flow.target->popupPresenter(), nullptr);
    QCOMPARE(flow.itemsThere(), QStringList({"call+"}));
    flow.host()->setTarget(nullptr);
    QCOMPARE(other.popupPresenter(), nullptr);
}

QTEST_MAIN(tst_PopupHost)
#include "tst_popuphost.moc"
