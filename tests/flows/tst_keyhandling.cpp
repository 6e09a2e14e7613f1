#include "driving.h"
#include "journal.h"
#include "librarytest.h"

#include <HmiStateMachine/hmi/hmistate.h>
#include <HmiStateMachine/named/keysignaltransition.h>

#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

constexpr int back = 4;
constexpr int menu = 5;
constexpr int released = 0;
constexpr int pressed = 1;
constexpr int anyStatus = -1;

} // namespace

/** The hard keys of the panel, and what brings the layers above the screens up and down. */
class Panel : public QObject
{
    Q_OBJECT

public:
    void push(int code)
    {
        Q_EMIT key(code, pressed);
        Q_EMIT key(code, released);
    }

Q_SIGNALS:
    void key(int code, int status);
    void overlaySwitched();
    void noticeSwitched();
};

/**
 * Three parallel regions: the screens, an overlay and a notice. The menu key leads from the map to
 * the list, the back key from the list to the map.
 */
struct Flow
{
    Flow()
    {
        all->setChildMode(QState::ParallelStates);
        screens->setInitialHmiState(map);
        addKey(map, menu, list);
        addKey(list, back, map);
        overlayLayer->setInitialHmiState(overlayOff);
        overlayOff->addTransition(&panel, SIGNAL(overlaySwitched()), overlayOn);
        overlayOn->addTransition(&panel, SIGNAL(overlaySwitched()), overlayOff);
        noticeLayer->setInitialHmiState(noticeOff);
        noticeOff->addTransition(&panel, SIGNAL(noticeSwitched()), noticeOn);
        noticeOn->addTransition(&panel, SIGNAL(noticeSwitched()), noticeOff);
    }

    void start() { startIn(machine, all); }

    QString screen() const { return map->isActive() ? map->name() : list->name(); }

    KeySignalTransition *addKey(HmiState *from, int code, HmiState *to)
    {
        auto *transition =
            new KeySignalTransition(&panel, SIGNAL(key(int, int)), code, pressed, from);
        transition->setTargetState(to);
        transition->makeGloballyAvailable();
        return transition;
    }

    void block(HmiState *state, int code, int status = pressed)
    {
        state->blockKey(code, status, &panel, SIGNAL(key(int, int)));
    }

    Panel panel;
    QStateMachine machine;
    HmiState *const all = new HmiState("all", &machine);
    HmiState *const screens = new HmiState("screens", all);
    HmiState *const map = new HmiState("map", screens);
    HmiState *const list = new HmiState("list", screens);
    HmiState *const overlayLayer = new HmiState("overlayLayer", all);
    HmiState *const overlayOff = new HmiState("overlayOff", overlayLayer);
    HmiState *const overlayOn = new HmiState("overlayOn", overlayLayer);
    HmiState *const noticeLayer = new HmiState("noticeLayer", all);
    HmiState *const noticeOff = new HmiState("noticeOff", noticeLayer);
    HmiState *const noticeOn = new HmiState("noticeOn", noticeLayer);
};

class tst_KeyHandling : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void keysMoveBetweenScreens();
    void aKeyIsHandledInEveryRegionThatListens();
    void anOverlaySwallowsAKeyOnlyWhileItIsUp();
    void otherKeysPassABlockingOverlay();
    void aBlockOfOneStatusLeavesTheOthersAlone_data();
    void aBlockOfOneStatusLeavesTheOthersAlone();
    void aBlockCoversEveryScreenWithTheSameKey();
    void ofTwoBlockingLayersEitherSwallowsTheKey();
    void aKeyPublishedAfterTheBlockPasses();
    void anOverlayBroughtUpBeforeItBlocksSwallowsFromItsNextTime();
    void theOverlaysOwnKeyMovesItWhileTheScreensStay();
    void aLayerThatBlocksCoversItsOwnStatesToo();
    void aDestroyedOverlayBlocksNoMore();
    void theApplicationHearsOfEveryHandledKey();
};

void tst_KeyHandling::keysMoveBetweenScreens()
{
    Flow flow;
    QStringList screens;
    flow.start();

    for (int code : {back, menu, menu, back, menu}) {
        flow.panel.push(code);
        screens.append(flow.screen());
    }

    QCOMPARE(screens, QStringList({"map", "list", "list", "map", "list"}));
}

void tst_KeyHandling::aKeyIsHandledInEveryRegionThatListens()
{
    Flow flow;
    flow.addKey(flow.overlayOff, menu, flow.overlayOn);
    flow.start();

    flow.panel.push(menu);

    QCOMPARE(flow.screen(), QString("list"));
    QVERIFY(flow.overlayOn->isActive());
}

void tst_KeyHandling::anOverlaySwallowsAKeyOnlyWhileItIsUp()
{
    Flow flow;
    flow.block(flow.overlayOn, menu);
    flow.start();

    Q_EMIT flow.panel.overlaySwitched();
    flow.panel.push(menu);
    QCOMPARE(flow.screen(), QString("map"));
    QVERIFY(flow.overlayOn->isActive());

    Q_EMIT flow.panel.overlaySwitched();
    flow.panel.push(menu);
    QCOMPARE(flow.screen(), QString("list"));
}

void tst_KeyHandling::otherKeysPassABlockingOverlay()
{
    Flow flow;
    flow.block(flow.overlayOn, back);
    flow.start();
    Q_EMIT flow.panel.overlaySwitched();

    flow.panel.push(menu);
    QCOMPARE(flow.screen(), QString("list"));

    flow.panel.push(back);
    QCOMPARE(flow.screen(), QString("list"));
}

void tst_KeyHandling::aBlockOfOneStatusLeavesTheOthersAlone_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<QString>("screen");

    QTest::newRow("pressed") << pressed << "map";
    QTest::newRow("released") << released << "list";
    QTest::newRow("any, which nobody published") << anyStatus << "list";
}

void tst_KeyHandling::aBlockOfOneStatusLeavesTheOthersAlone()
{
    QFETCH(int, status);
    Flow flow;
    flow.block(flow.overlayOn, menu, status);
    flow.start();
    Q_EMIT flow.panel.overlaySwitched();

    flow.panel.push(menu);

    QTEST(flow.screen(), "screen");
}

void tst_KeyHandling::aBlockCoversEveryScreenWithTheSameKey()
{
    Flow flow;
    flow.addKey(flow.list, menu, flow.map);
    flow.block(flow.overlayOn, menu);
    flow.start();
    QStringList screens;

    for (int i = 0; i < 2; ++i) {
        Q_EMIT flow.panel.overlaySwitched();
        flow.panel.push(menu);
        screens.append(flow.screen());
        Q_EMIT flow.panel.overlaySwitched();
        flow.panel.push(menu);
        screens.append(flow.screen());
    }

    QCOMPARE(screens, QStringList({"map", "list", "list", "map"}));
}

void tst_KeyHandling::ofTwoBlockingLayersEitherSwallowsTheKey()
{
    Flow flow;
    flow.addKey(flow.list, menu, flow.map);
    flow.block(flow.overlayOn, menu);
    flow.block(flow.noticeOn, menu);
    flow.start();
    QStringList screens;
    const auto push = [&] {
        flow.panel.push(menu);
        screens.append(flow.screen());
    };

    Q_EMIT flow.panel.overlaySwitched();
    push();
    Q_EMIT flow.panel.noticeSwitched();
    push();
    Q_EMIT flow.panel.overlaySwitched();
    push();
    Q_EMIT flow.panel.noticeSwitched();
    push();

    QCOMPARE(screens, QStringList({"map", "map", "map", "list"}));
}

void tst_KeyHandling::aKeyPublishedAfterTheBlockPasses()
{
    Flow flow;
    flow.block(flow.overlayOn, back);
    flow.addKey(flow.map, back, flow.list);
    flow.start();
    Q_EMIT flow.panel.overlaySwitched();

    flow.panel.push(back);
    QCOMPARE(flow.screen(), QString("list"));

    flow.panel.push(back);
    QCOMPARE(flow.screen(), QString("list"));
}

void tst_KeyHandling::anOverlayBroughtUpBeforeItBlocksSwallowsFromItsNextTime()
{
    Flow flow;
    flow.addKey(flow.list, menu, flow.map);
    flow.start();
    Q_EMIT flow.panel.overlaySwitched();

    flow.block(flow.overlayOn, menu);
    flow.panel.push(menu);
    QCOMPARE(flow.screen(), QString("list"));

    Q_EMIT flow.panel.overlaySwitched();
    Q_EMIT flow.panel.overlaySwitched();
    flow.panel.push(menu);
    QCOMPARE(flow.screen(), QString("list"));
}

void tst_KeyHandling::theOverlaysOwnKeyMovesItWhileTheScreensStay()
{
    Flow flow;
    flow.addKey(flow.list, menu, flow.map);
    KeySignalTransition *close = flow.addKey(flow.overlayOn, menu, flow.overlayOff);
    QVERIFY(close->makeParallelExclusive(10));
    flow.block(flow.noticeOn, menu);
    flow.start();
    Q_EMIT flow.panel.overlaySwitched();

    flow.panel.push(menu);
    QCOMPARE(flow.screen(), QString("map"));
    QVERIFY(flow.overlayOff->isActive());

    flow.panel.push(menu);
    QCOMPARE(flow.screen(), QString("list"));
}

void tst_KeyHandling::aLayerThatBlocksCoversItsOwnStatesToo()
{
    Flow flow;
    flow.addKey(flow.overlayOn, back, flow.overlayOff);
    flow.block(flow.overlayLayer, back);
    flow.start();
    Q_EMIT flow.panel.overlaySwitched();

    flow.panel.push(back);

    QVERIFY(flow.overlayOn->isActive());
}

void tst_KeyHandling::aDestroyedOverlayBlocksNoMore()
{
    Flow flow;
    flow.block(flow.overlayOn, menu);
    flow.start();

    delete flow.overlayOn;
    flow.panel.push(menu);

    QCOMPARE(flow.screen(), QString("list"));
}

void tst_KeyHandling::theApplicationHearsOfEveryHandledKey()
{
    Flow flow;
    Journal journal;
    const auto transitions = flow.screens->findChildren<KeySignalTransition *>();
    for (KeySignalTransition *transition : transitions) {
        connect(transition, &KeySignalTransition::keyTransitionTriggered, this,
                [&journal](int code, int status) {
                    journal.add(QString("key %1 %2").arg(code).arg(status));
                });
    }
    connect(flow.map, &QState::entered, this, [&journal] { journal.add("map"); });
    connect(flow.list, &QState::entered, this, [&journal] { journal.add("list"); });
    flow.start();

    flow.panel.push(menu);
    flow.panel.push(menu);
    flow.panel.push(back);

    QCOMPARE(journal.lines(), QStringList({"map", "key 5 1", "list", "key 4 1", "map"}));
}

QTEST_GUILESS_MAIN(tst_KeyHandling)
#include "tst_keyhandling.moc"
