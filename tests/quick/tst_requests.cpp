#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"
#include "quickflow.h"
#include "scene.h"

#include <HmiStateMachineQuick/requests.h>

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** A flow with the requests of a scene to it, written as in QML. */
struct RequestFlow : QuickFlow
{
    explicit RequestFlow(MessageRecorder &messages) : QuickFlow(messages)
    {
        QObject::connect(requests, &Requests::requested, requests,
                         [this](const QString &kind, const QString &id, const QVariant &data) {
                             made.append(QVariant(QVariantList{kind, id, data}));
                         });
        QObject::connect(requests, &Requests::warned, requests,
                         [this](const QString &text) { warned.append(text); });
    }

    /** Runs a line of script in the scene and lets the machine settle. */
    void run(const QString &script)
    {
        QVERIFY(QMetaObject::invokeMethod(scene.root(), "run", Q_ARG(QVariant, script)));
        settle();
        settle();
    }

    Requests *const requests = target->requests();
    HmiViewState *const radio = new HmiViewState("RadioView", "Radio", screens);
    PopupState *const fuel = popup("car/fuel", "FuelView");
    PopupState *const call = overlayPopup("phone/call", "CallView");
    Scene scene{"Item { function run(script) { eval(script) } }"};
    QVariantList made;
    QStringList warned;
};

// A list in a list: with braces alone compilers differ on which of the two is meant.
QVariantList oneRequest(const QString &kind, const QString &id, const QVariant &data)
{
    QVariantList requests;
    requests.append(QVariant(QVariantList{kind, id, data}));
    return requests;
}

} // namespace

class tst_Requests : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void aViewIsRequested_data();
    void aViewIsRequested();
    void anObjectLiteralArrivesAsAMap_data();
    void anObjectLiteralArrivesAsAMap();
    void aScriptValueArrivesAsAMapToo();
    void backLeadsOneStepUnlessToldOtherwise_data();
    void backLeadsOneStepUnlessToldOtherwise();
    void aDepthOutOfRangeIsAWarning_data();
    void aDepthOutOfRangeIsAWarning();
    void theDepthMayLieAtTheEnds_data();
    void theDepthMayLieAtTheEnds();
    void aPopupIsRequestedAndDismissed_data();
    void aPopupIsRequestedAndDismissed();
    void thePopupInFrontOfEachLayerIsDismissed();
    void anEventReachesTheTransitions();
    void aKeyIsSentByItsName();
    void anUnknownKeyIsNotSent_data();
    void anUnknownKeyIsNotSent();
    void whatIsUnknownIsAWarning_data();
    void whatIsUnknownIsAWarning();
    void whatIsUnknownPassesSilentlyWithoutTheCheck_data();
    void whatIsUnknownPassesSilentlyWithoutTheCheck();
    void aPopupThatCannotBeDismissedIsAWarning();
    void aRequestIsAnnouncedBeforeItIsAnswered();
    void theCheckIsSwitched();
    void keysAreGiven();
};

void tst_Requests::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(Requests::staticMetaObject),
             QStringList({"signal checksIdsChanged()", "signal keysChanged()",
                          "signal keyChanged(int key, int status)",
                          "signal requested(QString kind, QString id, QVariant data)",
                          "signal warned(QString text)", "method view(QString id, QVariant data)",
                          "method view(QString id)", "method back(int depth, QString target)",
                          "method back(int depth)", "method back()",
                          "method popup(QString id, QVariant data)", "method popup(QString id)",
                          "method dismiss(QString id)", "method dismissAny()",
                          "method event(QString name, QVariant data)", "method event(QString name)",
                          "method key(QString name, int status)",
                          "property bool checksIds read write checksIdsChanged()",
                          "property QVariantMap keys read write keysChanged()"}));
    QCOMPARE(Requests::staticMetaObject.superClass(), &QObject::staticMetaObject);
}

void tst_Requests::aViewIsRequested_data()
{
    QTest::addColumn<QString>("id");

    QTest::newRow("by the name of its state") << "Radio";
    QTest::newRow("by its view id") << "RadioView";
}

void tst_Requests::aViewIsRequested()
{
    QFETCH(QString, id);
    RequestFlow flow(messages());
    flow.start();

    flow.run("Requests.view('" + id + "')");

    QCOMPARE(flow.target->activeView(), QString("RadioView"));
    QCOMPARE(flow.target->viewData().value("eventData"), QVariant());
    QCOMPARE(flow.made, oneRequest("view", id, QVariant()));
    QCOMPARE(flow.warned, QStringList());
}

void tst_Requests::anObjectLiteralArrivesAsAMap_data()
{
    QTest::addColumn<QString>("script");
    QTest::addColumn<QVariant>("data");

    QTest::newRow("an object") << "{ track: 7, tags: ['a', 'b'] }"
                               << QVariant(QVariantMap(
                                      {{"track", 7}, {"tags", QVariantList({"a", "b"})}}));
    QTest::newRow("a list") << "[1, 2]" << QVariant(QVariantList({1, 2}));
    QTest::newRow("a text") << "'song'" << QVariant("song");
    QTest::newRow("a number") << "7" << QVariant(7);
    QTest::newRow("nothing") << "undefined" << QVariant();
}

void tst_Requests::anObjectLiteralArrivesAsAMap()
{
    QFETCH(QString, script);
    QFETCH(QVariant, data);
    RequestFlow flow(messages());
    auto *transition = new HmiTransition("tune", flow.home);
    transition->setTargetState(flow.home);
    flow.start();
    flow.made.clear();

    flow.run("Requests.view('Radio', " + script + ")");
    QCOMPARE(flow.target->viewData().value("eventData"), data);

    flow.run("Requests.popup('FuelView', " + script + ")");
    QCOMPARE(flow.target->shownPopups()->entry(0).data.toMap().value("eventData"), data);

    flow.run("Requests.event('tune', " + script + ")");
    QCOMPARE(flow.made,
             QVariantList({QVariantList({"view", "Radio", data}),
                           QVariantList({"popup", "FuelView", data}),
                           QVariantList({"event", "tune", data})}));
}

void tst_Requests::aScriptValueArrivesAsAMapToo()
{
    RequestFlow flow(messages());
    flow.start();
    QJSValue value = flow.scene.engine.newObject(); // as signals of a scene hand over
    value.setProperty("track", 7);

    flow.requests->view("Radio", QVariant::fromValue(value));
    settle();

    const QVariant data = flow.target->viewData().value("eventData");
    QCOMPARE(data.userType(), int(QMetaType::QVariantMap)); // equal values may differ in it
    QCOMPARE(data, QVariant(QVariantMap({{"track", 7}})));
}

void tst_Requests::backLeadsOneStepUnlessToldOtherwise_data()
{
    QTest::addColumn<QString>("script");
    QTest::addColumn<QString>("view");

    QTest::newRow("one step") << "Requests.back()"
                              << "Map";
    QTest::newRow("two steps") << "Requests.back(2)"
                               << "Phone";
    QTest::newRow("to a view") << "Requests.back(1, 'Home')"
                               << "Home";
}

void tst_Requests::backLeadsOneStepUnlessToldOtherwise()
{
    QFETCH(QString, script);
    RequestFlow flow(messages());
    for (const char *name : {"Phone", "Map", "Seats"}) {
        flow.view(name);
    }
    flow.start();
    for (const char *name : {"Phone", "Map", "Seats"}) {
        flow.request(name);
    }

    flow.run(script);

    QTEST(flow.activeView(), "view");
    QCOMPARE(flow.warned, QStringList());
}

void tst_Requests::aDepthOutOfRangeIsAWarning_data()
{
    QTest::addColumn<int>("depth");
    QTest::addColumn<QString>("warning");

    QTest::newRow("negative") << -1 << "a back depth lies from 0 to 255, not at -1";
    QTest::newRow("too large") << 256 << "a back depth lies from 0 to 255, not at 256";
}

void tst_Requests::aDepthOutOfRangeIsAWarning()
{
    QFETCH(int, depth);
    QFETCH(QString, warning);
    RequestFlow flow(messages());
    flow.view("Map");
    flow.start();
    flow.request("Map");
    flow.requests->setChecksIds(false);

    flow.run(QString("Requests.back(%1)").arg(depth));

    QCOMPARE(flow.activeView(), QString("Map"));
    QCOMPARE(flow.made, QVariantList());
    QCOMPARE(flow.warned, QStringList({warning}));
    QCOMPARE(flow.takeMessages(), QStringList({warning}));
}

void tst_Requests::theDepthMayLieAtTheEnds_data()
{
    QTest::addColumn<int>("depth");

    QTest::newRow("0") << 0;
    QTest::newRow("255") << 255;
}

void tst_Requests::theDepthMayLieAtTheEnds()
{
    QFETCH(int, depth);
    RequestFlow flow(messages());
    flow.view("Map");
    flow.start();
    flow.request("Map");

    flow.run(QString("Requests.back(%1)").arg(depth));

    QCOMPARE(flow.activeView(), QString("Home"));
    QCOMPARE(flow.made, oneRequest("back", "", depth));
}

void tst_Requests::aPopupIsRequestedAndDismissed_data()
{
    QTest::addColumn<QString>("id");

    QTest::newRow("by the name of its state") << "car/fuel";
    QTest::newRow("by its popup view id") << "FuelView";
}

void tst_Requests::aPopupIsRequestedAndDismissed()
{
    QFETCH(QString, id);
    RequestFlow flow(messages());
    flow.start();

    flow.run("Requests.popup('" + id + "', 'low')");
    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList({"FuelView"}));
    QCOMPARE(flow.target->shownPopups()->entry(0).data,
             QVariant(QVariantMap({{"eventData", "low"}})));

    flow.run("Requests.dismiss('" + id + "')");
    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList());
    QCOMPARE(flow.made,
             QVariantList(
                 {QVariantList({"popup", id, "low"}), QVariantList({"dismiss", id, QVariant()})}));
    QCOMPARE(flow.warned, QStringList());
}

void tst_Requests::thePopupInFrontOfEachLayerIsDismissed()
{
    RequestFlow flow(messages());
    flow.start();
    flow.requestPopup("car/fuel");
    flow.requestPopup("phone/call");

    flow.run("Requests.dismissAny()");

    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList());
    QCOMPARE(flow.made, oneRequest("dismissAny", "", QVariant()));
}

void tst_Requests::anEventReachesTheTransitions()
{
    RequestFlow flow(messages());
    auto *transition = new HmiTransition("tune", flow.home);
    transition->setTargetState(flow.radio);
    flow.start();

    flow.run("Requests.event('tune', 'up')");

    QCOMPARE(flow.activeView(), QString("Radio"));
    QCOMPARE(flow.made, oneRequest("event", "tune", "up"));
}

void tst_Requests::aKeyIsSentByItsName()
{
    RequestFlow flow(messages());
    auto *transition =
        new KeySignalTransition(flow.requests, SIGNAL(keyChanged(int, int)), 42, 1, flow.home);
    transition->setTargetState(flow.radio);
    flow.requests->setKeys({{"RADIO", 42}, {"HOME", 7}});
    flow.start();
    QSignalSpy keys(flow.requests, &Requests::keyChanged);
    QVERIFY(keys.isValid());

    flow.run("Requests.key('RADIO', 0)");
    QCOMPARE(flow.activeView(), QString("Home"));

    flow.run("Requests.key('RADIO', 1)");
    QCOMPARE(flow.activeView(), QString("Radio"));
    QCOMPARE(keys, QList<QVariantList>({{42, 0}, {42, 1}}));
    QCOMPARE(flow.made,
             QVariantList({QVariantList({"key", "RADIO", 0}), QVariantList({"key", "RADIO", 1})}));
}

void tst_Requests::anUnknownKeyIsNotSent_data()
{
    QTest::addColumn<bool>("checksIds");
    QTest::addColumn<QStringList>("warnings");

    QTest::newRow("checked") << true << QStringList{"there is no key named \"MENU\""};
    QTest::newRow("unchecked") << false << QStringList();
}

void tst_Requests::anUnknownKeyIsNotSent()
{
    QFETCH(bool, checksIds);
    RequestFlow flow(messages());
    flow.requests->setKeys({{"RADIO", 42}});
    flow.requests->setChecksIds(checksIds);
    QSignalSpy keys(flow.requests, &Requests::keyChanged);
    QVERIFY(keys.isValid());

    flow.run("Requests.key('MENU', 1)");

    QCOMPARE(keys.size(), 0);
    QCOMPARE(flow.made, QVariantList());
    QTEST(flow.warned, "warnings");
    QTEST(flow.takeMessages(), "warnings");
}

void tst_Requests::whatIsUnknownIsAWarning_data()
{
    QTest::addColumn<QString>("script");
    QTest::addColumn<QString>("warning");

    QTest::newRow("view") << "Requests.view('Nowhere')"
                          << "there is no state or view named \"Nowhere\"";
    QTest::newRow("back target") << "Requests.back(1, 'Nowhere')"
                                 << "there is no state or view named \"Nowhere\"";
    QTest::newRow("popup") << "Requests.popup('Nothing')"
                           << "there is no popup named \"Nothing\"";
    QTest::newRow("dismissal") << "Requests.dismiss('Nothing')"
                               << "there is no popup named \"Nothing\"";
    QTest::newRow("popup by the name of a view") << "Requests.popup('Home')"
                                                 << "there is no popup named \"Home\"";
}

void tst_Requests::whatIsUnknownIsAWarning()
{
    QFETCH(QString, script);
    QFETCH(QString, warning);
    RequestFlow flow(messages());
    flow.requests->setChecksIds(true);
    flow.start();

    flow.run(script);

    QCOMPARE(flow.warned, QStringList({warning}));
    QCOMPARE(flow.takeMessages(), QStringList({warning}));
    QCOMPARE(flow.made.size(), 1);
    QCOMPARE(flow.activeView(), QString("Home"));
}

void tst_Requests::whatIsUnknownPassesSilentlyWithoutTheCheck_data()
{
    whatIsUnknownIsAWarning_data();
}

void tst_Requests::whatIsUnknownPassesSilentlyWithoutTheCheck()
{
    QFETCH(QString, script);
    RequestFlow flow(messages());
    flow.requests->setChecksIds(false);
    flow.start();

    flow.run(script);

    QCOMPARE(flow.warned, QStringList());
    QCOMPARE(flow.takeMessages(), QStringList());
    QCOMPARE(flow.made.size(), 1);
    QCOMPARE(flow.activeView(), QString("Home"));
}

void tst_Requests::aPopupThatCannotBeDismissedIsAWarning()
{
    RequestFlow flow(messages());
    flow.fuel->dismissTransition()->setDismissTarget(QString());
    flow.start();

    flow.run("Requests.dismiss('FuelView')");

    const QStringList warnings{"the popup \"FuelView\" cannot be dismissed"};
    QCOMPARE(flow.warned, warnings);
    QCOMPARE(flow.takeMessages(), warnings);
}

void tst_Requests::aRequestIsAnnouncedBeforeItIsAnswered()
{
    RequestFlow flow(messages());
    flow.start();
    QStringList views;
    connect(flow.requests, &Requests::requested, this,
            [&] { views.append(flow.target->activeView()); });

    flow.run("Requests.view('Radio')");

    QCOMPARE(views, QStringList({"Home"}));
}

void tst_Requests::theCheckIsSwitched()
{
    Requests requests;
    QSignalSpy spy(&requests, &Requests::checksIdsChanged);
    QVERIFY(spy.isValid());
    requests.setChecksIds(false);
    spy.clear();

    requests.setChecksIds(true);
    requests.setChecksIds(true);

    QCOMPARE(requests.checksIds(), true);
    QCOMPARE(spy.size(), 1);
}

void tst_Requests::keysAreGiven()
{
    Requests requests;
    QSignalSpy spy(&requests, &Requests::keysChanged);
    QVERIFY(spy.isValid());
    QCOMPARE(requests.keys(), QVariantMap());

    requests.setKeys({{"RADIO", 42}});
    requests.setKeys({{"RADIO", 42}});

    QCOMPARE(requests.keys(), QVariantMap({{"RADIO", 42}}));
    QCOMPARE(spy.size(), 1);
}

QTEST_MAIN(tst_Requests)
#include "tst_requests.moc"
