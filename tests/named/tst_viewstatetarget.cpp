#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"
#include "popupflow.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/namedstate.h>

#include <QMetaType>
#include <QtTest>

#include <functional>

using namespace HmiStateMachine;

using Emission = std::function<void(ViewStateTarget &)>;
Q_DECLARE_METATYPE(Emission)

namespace {

/** Listens as an application does that was written against the string-based connections. */
class Listener : public QObject
{
    Q_OBJECT

public:
    QStringList heard;

public Q_SLOTS:
    void onViews(Identifier first, Identifier second) { heard.append(first + ' ' + second); }

    void onPopup(Identifier popupId, bool shown)
    {
        heard.append(popupId + (shown ? " shown" : " hidden"));
    }

    void onAnimation(Identifier viewId, int type)
    {
        heard.append(viewId + ' ' + QString::number(type));
    }

    void onDomains(int newDomain, int oldDomain)
    {
        heard.append(QString::number(newDomain) + ' ' + QString::number(oldDomain));
    }

    void onData(QVariant data) { heard.append(data.toString()); }
};

} // namespace

class tst_ViewStateTarget : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void thereIsNoInstanceUntilTheApplicationSetsIt();
    void theInstanceIsWhatTheApplicationHasSet();
    void identifiersAreKnownToTheMetaTypeSystem_data();
    void identifiersAreKnownToTheMetaTypeSystem();
    void aSpyRecordsTheValuesOfASignal_data();
    void aSpyRecordsTheValuesOfASignal();
    void queuedConnectionsDeliverTheValues();
    void theActiveDomainIsAProperty();
    void theActiveViewIsAProperty();
    void theActiveViewIsAnnouncedNewOneFirst();
    void nothingIsStackedAtFirst();
    void stackedPopupsAreListedOldestFirst();
    void aPopupIsStackedOnce();
    void thePopupThatCoversAnotherIsNotStacked();
    void unstackingKeepsTheOrderOfTheRest_data();
    void unstackingKeepsTheOrderOfTheRest();
    void anUnstackedPopupIsStackedAnewAtTheEnd();
    void theListOfStackedPopupsIsACopy();
    void aPopupIsActiveByItsViewId();
    void thereIsNoVoiceRequestAtFirst();
    void aVoiceRequestIsKeptUntilItIsChanged();
    void aVoiceRequestComesFromTheTransitionThatFires();
};

void tst_ViewStateTarget::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(ViewStateTarget::staticMetaObject),
             QStringList(
                 {"signal activeDomainChanged(int newDomain, int oldDomain)",
                  "signal activeViewChanged(Identifier newViewId, Identifier oldViewId)",
                  "signal viewAboutToBeActivated(Identifier oldViewId, Identifier newViewId)",
                  "signal viewActivated(Identifier oldViewId, Identifier newViewId)",
                  "signal popupStatusChanged(Identifier popupId, bool shown)",
                  "signal viewAnimationStarted(Identifier viewId, int type)",
                  "signal popupAnimationStarted(Identifier viewId, int type)",
                  "signal activeViewDataChanged(QVariant data)",
                  "property int activeDomain read activeDomainChanged(int,int)",
                  "property Identifier activeView read activeViewChanged(Identifier,Identifier)"}));
    QCOMPARE(ViewStateTarget::staticMetaObject.superClass(), &QObject::staticMetaObject);
}

void tst_ViewStateTarget::thereIsNoInstanceUntilTheApplicationSetsIt()
{
    QCOMPARE(ViewStateTarget::instance(), nullptr);
    QCOMPARE(ViewStateTarget::VIEW_STATE_TARGET_INSTANCE, nullptr);
}

void tst_ViewStateTarget::theInstanceIsWhatTheApplicationHasSet()
{
    Journal journal;
    RecordingViewStateTarget first(journal);
    RecordingViewStateTarget second(journal);
    QCOMPARE(ViewStateTarget::instance(), &second);

    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = &first;
    QCOMPARE(ViewStateTarget::instance(), &first);

    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;
    QCOMPARE(ViewStateTarget::instance(), nullptr);
}

void tst_ViewStateTarget::identifiersAreKnownToTheMetaTypeSystem_data()
{
    QTest::addColumn<QByteArray>("name");

    QTest::newRow("as signals spell it") << QByteArray("Identifier");
    QTest::newRow("in full") << QByteArray("HmiStateMachine::Identifier");
}

void tst_ViewStateTarget::identifiersAreKnownToTheMetaTypeSystem()
{
    QFETCH(QByteArray, name);

    QCOMPARE(QMetaType::type(name), int(QMetaType::QString));
}

void tst_ViewStateTarget::aSpyRecordsTheValuesOfASignal_data()
{
    QTest::addColumn<QByteArray>("signal");
    QTest::addColumn<Emission>("emission");
    QTest::addColumn<QVariantList>("values");

    QTest::newRow("domain") << QByteArray(SIGNAL(activeDomainChanged(int, int)))
                            << Emission([](auto &t) { Q_EMIT t.activeDomainChanged(2, 1); })
                            << QVariantList({2, 1});
    QTest::newRow("view") << QByteArray(SIGNAL(activeViewChanged(Identifier, Identifier)))
                          << Emission([](auto &t) { Q_EMIT t.activeViewChanged("Map", "Home"); })
                          << QVariantList({"Map", "Home"});
    QTest::newRow("view to come") << QByteArray(SIGNAL(viewAboutToBeActivated(
        Identifier, Identifier))) << Emission([](auto &t) {
        Q_EMIT t.viewAboutToBeActivated("Home", "Map");
    }) << QVariantList({"Home", "Map"});
    QTest::newRow("view shown") << QByteArray(SIGNAL(viewActivated(Identifier, Identifier)))
                                << Emission([](auto &t) { Q_EMIT t.viewActivated("Home", "Map"); })
                                << QVariantList({"Home", "Map"});
    QTest::newRow("popup") << QByteArray(SIGNAL(popupStatusChanged(Identifier, bool)))
                           << Emission([](auto &t) { Q_EMIT t.popupStatusChanged("Call", true); })
                           << QVariantList({"Call", true});
    QTest::newRow("view animation")
        << QByteArray(SIGNAL(viewAnimationStarted(Identifier, int)))
        << Emission([](auto &t) { Q_EMIT t.viewAnimationStarted("Map", 3); })
        << QVariantList({"Map", 3});
    QTest::newRow("popup animation")
        << QByteArray(SIGNAL(popupAnimationStarted(Identifier, int)))
        << Emission([](auto &t) { Q_EMIT t.popupAnimationStarted("Call", 4); })
        << QVariantList({"Call", 4});
    QTest::newRow("view data") << QByteArray(SIGNAL(activeViewDataChanged(QVariant)))
                               << Emission([](auto &t) {
                                      Q_EMIT t.activeViewDataChanged(QVariant("song"));
                                  })
                               << QVariantList({"song"});
}

void tst_ViewStateTarget::aSpyRecordsTheValuesOfASignal()
{
    QFETCH(QByteArray, signal);
    QFETCH(Emission, emission);
    QFETCH(QVariantList, values);
    Journal journal;
    RecordingViewStateTarget target(journal);
    QSignalSpy spy(&target, signal.constData());
    QVERIFY(spy.isValid());

    emission(target);

    QCOMPARE(spy.size(), 1);
    QCOMPARE(spy.first().size(), values.size());
    for (int i = 0; i < values.size(); ++i) {
        const QVariant recorded = spy.first().at(i);
        QCOMPARE(recorded.userType() == qMetaTypeId<QVariant>() ? recorded.value<QVariant>()
                                                                : recorded,
                 values.at(i));
    }
}

void tst_ViewStateTarget::queuedConnectionsDeliverTheValues()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    Listener listener;
    const auto listen = [&](const char *signal, const char *slot) {
        QVERIFY(connect(&target, signal, &listener, slot, Qt::QueuedConnection));
    };
    listen(SIGNAL(activeDomainChanged(int, int)), SLOT(onDomains(int, int)));
    listen(SIGNAL(activeViewChanged(Identifier, Identifier)),
           SLOT(onViews(Identifier, Identifier)));
    listen(SIGNAL(viewActivated(Identifier, Identifier)), SLOT(onViews(Identifier, Identifier)));
    listen(SIGNAL(popupStatusChanged(Identifier, bool)), SLOT(onPopup(Identifier, bool)));
    listen(SIGNAL(viewAnimationStarted(Identifier, int)), SLOT(onAnimation(Identifier, int)));
    listen(SIGNAL(activeViewDataChanged(QVariant)), SLOT(onData(QVariant)));

    Q_EMIT target.activeDomainChanged(2, 1);
    Q_EMIT target.activeViewChanged("Map", "Home");
    Q_EMIT target.viewActivated("Home", "Map");
    Q_EMIT target.popupStatusChanged("Call", false);
    Q_EMIT target.viewAnimationStarted("Map", 3);
    Q_EMIT target.activeViewDataChanged("song");
    QCOMPARE(listener.heard, QStringList());
    settle();

    QCOMPARE(listener.heard,
             QStringList({"2 1", "Map Home", "Home Map", "Call hidden", "Map 3", "song"}));
}

void tst_ViewStateTarget::theActiveDomainIsAProperty()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    target.setActiveDomain(3);
    QSignalSpy changes(&target, &ViewStateTarget::activeDomainChanged);
    QVERIFY(changes.isValid());

    target.setActiveDomain(5);

    QCOMPARE(target.property("activeDomain"), QVariant(5));
    QCOMPARE(changes.size(), 1);
    QCOMPARE(changes.first(), QVariantList({5, 3}));
    QVERIFY(!target.setProperty("activeDomain", 7));
}

void tst_ViewStateTarget::theActiveViewIsAProperty()
{
    Journal journal;
    RecordingViewStateTarget target(journal);

    target.setActiveView("Map");

    QCOMPARE(target.property("activeView"), QVariant("Map"));
    QVERIFY(!target.setProperty("activeView", "Home"));
}

void tst_ViewStateTarget::theActiveViewIsAnnouncedNewOneFirst()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    target.setActiveView("Home");
    QSignalSpy changes(&target, SIGNAL(activeViewChanged(Identifier, Identifier)));
    QVERIFY(changes.isValid());

    target.setActiveView("Map");

    QCOMPARE(changes.size(), 1);
    QCOMPARE(changes.first(), QVariantList({"Map", "Home"}));
}

void tst_ViewStateTarget::nothingIsStackedAtFirst()
{
    Journal journal;
    const RecordingViewStateTarget target(journal);

    QCOMPARE(target.stackedPopups(), QList<QString>());
}

void tst_ViewStateTarget::stackedPopupsAreListedOldestFirst()
{
    Journal journal;
    RecordingViewStateTarget target(journal);

    target.stackPopup("Volume", "Call");
    target.stackPopup("Call", "Alarm");
    target.stackPopup("Alarm", "Warning");

    QCOMPARE(target.stackedPopups(), QList<QString>({"Volume", "Call", "Alarm"}));
}

void tst_ViewStateTarget::aPopupIsStackedOnce()
{
    Journal journal;
    RecordingViewStateTarget target(journal);

    target.stackPopup("Volume", "Call");
    target.stackPopup("Call", "Alarm");
    target.stackPopup("Volume", "Alarm");

    QCOMPARE(target.stackedPopups(), QList<QString>({"Volume", "Call"}));
}

void tst_ViewStateTarget::thePopupThatCoversAnotherIsNotStacked()
{
    Journal journal;
    RecordingViewStateTarget target(journal);

    target.stackPopup("Volume", "Call");
    target.unstackPopup("Call");

    QCOMPARE(target.stackedPopups(), QList<QString>({"Volume"}));
}

void tst_ViewStateTarget::unstackingKeepsTheOrderOfTheRest_data()
{
    QTest::addColumn<QString>("popup");
    QTest::addColumn<QStringList>("rest");

    QTest::newRow("oldest") << "Volume" << QStringList({"Call", "Alarm"});
    QTest::newRow("in the middle") << "Call" << QStringList({"Volume", "Alarm"});
    QTest::newRow("latest") << "Alarm" << QStringList({"Volume", "Call"});
    QTest::newRow("not stacked") << "Traffic" << QStringList({"Volume", "Call", "Alarm"});
    QTest::newRow("of another case") << "call" << QStringList({"Volume", "Call", "Alarm"});
    QTest::newRow("no name") << "" << QStringList({"Volume", "Call", "Alarm"});
}

void tst_ViewStateTarget::unstackingKeepsTheOrderOfTheRest()
{
    QFETCH(QString, popup);
    QFETCH(QStringList, rest);
    Journal journal;
    RecordingViewStateTarget target(journal);
    target.stackPopup("Volume", "Call");
    target.stackPopup("Call", "Alarm");
    target.stackPopup("Alarm", "Warning");

    target.unstackPopup(popup);

    QCOMPARE(QStringList(target.stackedPopups()), rest);
}

void tst_ViewStateTarget::anUnstackedPopupIsStackedAnewAtTheEnd()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    target.stackPopup("Volume", "Call");
    target.stackPopup("Call", "Alarm");

    target.unstackPopup("Volume");
    target.stackPopup("Volume", "Alarm");

    QCOMPARE(target.stackedPopups(), QList<QString>({"Call", "Volume"}));
}

void tst_ViewStateTarget::theListOfStackedPopupsIsACopy()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    target.stackPopup("Volume", "Call");
    QList<QString> list = target.stackedPopups();

    list.append("Call");

    QCOMPARE(target.stackedPopups(), QList<QString>({"Volume"}));
}

void tst_ViewStateTarget::aPopupIsActiveByItsViewId()
{
    PopupFlow flow(messages());
    flow.popup("targetactive/fuel", "FuelView");
    flow.start();
    QVERIFY(!flow.target.isPopupStateActive("FuelView"));

    flow.request("targetactive/fuel");
    QVERIFY(flow.target.isPopupStateActive("FuelView"));
    QVERIFY(!flow.target.isPopupStateActive("targetactive/fuel"));
    QVERIFY(!flow.target.isPopupStateActive(""));

    flow.request("targetactive/fuel_Dismiss");
    QVERIFY(!flow.target.isPopupStateActive("FuelView"));
}

void tst_ViewStateTarget::thereIsNoVoiceRequestAtFirst()
{
    Journal journal;
    const RecordingViewStateTarget target(journal);

    QCOMPARE(target.vrViewRequest(), false);
    QCOMPARE(target.vrViewRequestData(), QVariant());
}

void tst_ViewStateTarget::aVoiceRequestIsKeptUntilItIsChanged()
{
    Journal journal;
    RecordingViewStateTarget target(journal);

    target.setVRViewRequest(true, "call Anna");
    settle();
    QCOMPARE(target.vrViewRequest(), true);
    QCOMPARE(target.vrViewRequestData(), QVariant("call Anna"));

    target.setVRViewRequest(false, 5);
    QCOMPARE(target.vrViewRequest(), false);
    QCOMPARE(target.vrViewRequestData(), QVariant(5));

    target.setVRViewRequest(true, QVariant());
    QCOMPARE(target.vrViewRequest(), true);
    QVERIFY(!target.vrViewRequestData().isValid());
}

void tst_ViewStateTarget::aVoiceRequestComesFromTheTransitionThatFires()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    QStateMachine machine;
    auto *home = new NamedState("Home", &machine);
    auto *phone = new NamedState("Phone", &machine);
    auto *transition = new GuardedTransition(home);
    transition->setAllowTransitionDefault(true);
    transition->setNamedTargetState("Phone");
    transition->setIsVREventTransition(true, "call Anna");
    bool toldOnEntry = false;
    connect(phone, &QAbstractState::entered, phone, [&] { toldOnEntry = target.vrViewRequest(); });

    startIn(machine, home);

    QVERIFY(phone->isActive());
    QVERIFY(toldOnEntry);
    QCOMPARE(target.vrViewRequestData(), QVariant("call Anna"));
}

QTEST_GUILESS_MAIN(tst_ViewStateTarget)
#include "tst_viewstatetarget.moc"
