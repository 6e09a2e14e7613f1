#include "interruptions.h"
#include "librarytest.h"
#include "metadescription.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** Which of "phone/call", any module's "call" and the whole module "phone" have an entry. */
struct Entries
{
    const char *tag;
    QStringList keys;
    int winner; ///< position of the key that answers, counted from 1; 0 for none
};

const QString exact = "phone/call";
const QString anyCall = "*/call";
const QString anyPhone = "phone/*";

const QList<Entries> popupEntries = {
    {"no popup", {}, 0},
    {"popup", {exact}, 1},
    {"popup of any module", {anyCall}, 2},
    {"popup of the module", {anyPhone}, 3},
    {"popup, of any module", {anyCall, exact}, 1},
    {"popup, of the module", {anyPhone, exact}, 1},
    {"popup of any module, of the module", {anyPhone, anyCall}, 2},
    {"popup, of any module, of the module", {anyPhone, anyCall, exact}, 1},
};

const QString target = "car/fuel";
const QString anyFuel = "*/fuel";
const QString anyCar = "car/*";

const QList<Entries> targetEntries = {
    {"no target", {}, 0},
    {"target", {target}, 1},
    {"target of any module", {anyFuel}, 2},
    {"target of the module", {anyCar}, 3},
    {"target, of any module", {anyFuel, target}, 1},
    {"target, of the module", {anyCar, target}, 1},
    {"target of any module, of the module", {anyCar, anyFuel}, 2},
    {"target, of any module, of the module", {anyCar, anyFuel, target}, 1},
};

const QList<QPair<QString, int>> popupPositions = {{exact, 1}, {anyCall, 2}, {anyPhone, 3}};
const QList<QPair<QString, int>> targetPositions = {{target, 1}, {anyFuel, 2}, {anyCar, 3}};

// A value of its own for each pair of entries, so that the answer tells which rule gave it.
PopupState::InterruptionBehavior ruleOf(int popupPosition, int targetPosition)
{
    return static_cast<PopupState::InterruptionBehavior>(10 * popupPosition + targetPosition);
}

// A popup shown as another view than its name says.
PopupState *popupShownAs(const QString &viewId, const QString &name, QState *parent)
{
    auto *popup = new PopupState(name, 1);
    popup->setParent(parent);
    popup->setPopupViewId(viewId);
    return popup;
}

} // namespace

/** What the store answers; how it loads a file is told apart. */
class tst_PopupInterruptionStore : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void addsNothingToTheMetaObject();
    void theProcessHasOneStore();
    void aNewStoreFollowsADeletedOne();
    void behaviorTexts_data();
    void behaviorTexts();
    void wildCardsOfAName_data();
    void wildCardsOfAName();
    void anEmptyStoreAllowsAndBlocksNothing_data();
    void anEmptyStoreAllowsAndBlocksNothing();
    void theMostExactRuleAnswers_data();
    void theMostExactRuleAnswers();
    void theMostExactDefaultAnswers_data();
    void theMostExactDefaultAnswers();
    void aRuleGoesBeforeADefault_data();
    void aRuleGoesBeforeADefault();
    void anExactEntryHidesTheRulesOfItsWildCards();
    void aHiddenWildCardLeavesItsDefault();
    void anInvalidDefaultIsMinusOne();
    void namesThatWildCardsMeet_data();
    void namesThatWildCardsMeet();
    void anEmptyNameMeetsItsOwnEntryAlone();
    void aLaterRuleReplacesTheFormerOne();
    void aWildCardMayBeAddedAfterALookup();
    void rulesGoByTheNamesOfTheStates();
    void blacklistsGoByThePopupViewIds();
    void theMostExactBlacklistDecidesAlone_data();
    void theMostExactBlacklistDecidesAlone();
    void blacklistsAndRulesAreKeptApart();
    void theActiveDomainAndViewAreThoseOfTheViewLayer();
    void withoutAViewLayerNothingActiveBlocks();
};

void tst_PopupInterruptionStore::addsNothingToTheMetaObject()
{
    QCOMPARE(metaDescription(PopupInterruptionStore::staticMetaObject), QStringList());
    QCOMPARE(PopupInterruptionStore::staticMetaObject.className(),
             "HmiStateMachine::PopupInterruptionStore");
}

void tst_PopupInterruptionStore::theProcessHasOneStore()
{
    PopupInterruptionStore *store = PopupInterruptionStore::instance();

    QVERIFY(store);
    QCOMPARE(PopupInterruptionStore::instance(), store);
    QCOMPARE(store->parent(), QCoreApplication::instance());
}

void tst_PopupInterruptionStore::aNewStoreFollowsADeletedOne()
{
    PopupInterruptionStore::instance()->insertInterruptionBehavior(PopupState::Prohibit, "gone/a",
                                                                   "gone/b");

    delete PopupInterruptionStore::instance();

    QVERIFY(PopupInterruptionStore::instance());
    QCOMPARE(PopupInterruptionStore::instance()->parent(), QCoreApplication::instance());
    QCOMPARE(PopupInterruptionStore::instance()->getInterruptionBehavior("gone/a", "gone/b"),
             PopupState::Allow);
}

void tst_PopupInterruptionStore::behaviorTexts_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<int>("behavior");

    QTest::newRow("prohibit") << "Prohibit" << 0;
    QTest::newRow("allow") << "Allow" << 1;
    QTest::newRow("stack") << "AllowStack" << 2;
    QTest::newRow("no return") << "AllowNoReturn" << 3;
    QTest::newRow("small letters") << "allowstack" << 2;
    QTest::newRow("capitals") << "PROHIBIT" << 0;
    QTest::newRow("mixed letters") << "aLLOWnOrETURN" << 3;
    QTest::newRow("a longer text") << "Allowed" << -1;
    QTest::newRow("a shorter text") << "Prohibi" << -1;
    QTest::newRow("a space before") << " Allow" << -1;
    QTest::newRow("a space behind") << "Allow " << -1;
    QTest::newRow("a number") << "1" << -1;
    QTest::newRow("empty") << "" << -1;
    QTest::newRow("null") << QString() << -1;
}

void tst_PopupInterruptionStore::behaviorTexts()
{
    QFETCH(QString, text);

    QTEST(static_cast<int>(behaviorFromString(text)), "behavior");
}

void tst_PopupInterruptionStore::wildCardsOfAName_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("popupWildCard");
    QTest::addColumn<QString>("moduleWildCard");

    QTest::newRow("two parts") << "phone/call"
                               << "*/call"
                               << "phone/*";
    QTest::newRow("three parts") << "a/b/c"
                                 << "*/b"
                                 << "a/*";
    QTest::newRow("no slash") << "call"
                              << ""
                              << "";
    QTest::newRow("empty") << ""
                           << ""
                           << "";
    QTest::newRow("null") << QString() << ""
                          << "";
    QTest::newRow("no module") << "/b"
                               << "*/b"
                               << "/*";
    QTest::newRow("no popup") << "a/"
                              << "*/"
                              << "a/*";
    QTest::newRow("a slash alone") << "/"
                                   << "*/"
                                   << "/*";
    QTest::newRow("an empty part between") << "a//c"
                                           << "*/"
                                           << "a/*";
    QTest::newRow("both parts open") << "*/*"
                                     << "*/*"
                                     << "*/*";
    QTest::newRow("a popup wildcard") << "*/b"
                                      << "*/b"
                                      << "*/*";
    QTest::newRow("a module wildcard") << "a/*"
                                       << "*/*"
                                       << "a/*";
    QTest::newRow("other letters")
        << QString::fromUtf8("\u00fc/\u00df") << QString::fromUtf8("*/\u00df")
        << QString::fromUtf8("\u00fc/*");
}

void tst_PopupInterruptionStore::wildCardsOfAName()
{
    QFETCH(QString, name);

    QTEST(extractPopupWildCard(name), "popupWildCard");
    QTEST(extractModuleWildCard(name), "moduleWildCard");
}

void tst_PopupInterruptionStore::anEmptyStoreAllowsAndBlocksNothing_data()
{
    QTest::addColumn<QString>("name");

    for (const char *name : {"phone/call", "call", "", "/", "*/*", "a/b/c"}) {
        QTest::newRow(*name ? name : "empty") << name;
    }
}

void tst_PopupInterruptionStore::anEmptyStoreAllowsAndBlocksNothing()
{
    QFETCH(QString, name);
    const PopupInterruptionStore store;

    QCOMPARE(store.getInterruptionBehavior(name, name), PopupState::Allow);
    QVERIFY(!store.isBlockedByDomain(name, 0));
    QVERIFY(!store.isBlockedByView(name, name));
}

void tst_PopupInterruptionStore::theMostExactRuleAnswers_data()
{
    QTest::addColumn<QStringList>("popups");
    QTest::addColumn<QStringList>("targets");
    QTest::addColumn<int>("answer");

    for (const Entries &popups : popupEntries) {
        for (const Entries &targets : targetEntries) {
            const bool found = popups.winner != 0 && targets.winner != 0;
            const QByteArray tag = QByteArray(popups.tag) + "; " + targets.tag;
            QTest::newRow(tag.constData())
                << popups.keys << targets.keys << (found ? 10 * popups.winner + targets.winner : 1);
        }
    }
}

void tst_PopupInterruptionStore::theMostExactRuleAnswers()
{
    QFETCH(QStringList, popups);
    QFETCH(QStringList, targets);
    PopupInterruptionStore store;
    for (const auto &popup : popupPositions) {
        for (const auto &rule : targetPositions) {
            if (popups.contains(popup.first) && targets.contains(rule.first)) {
                store.insertInterruptionBehavior(ruleOf(popup.second, rule.second), popup.first,
                                                 rule.first);
            }
        }
    }

    QTEST(static_cast<int>(store.getInterruptionBehavior("phone/call", "car/fuel")), "answer");
    QCOMPARE(store.getInterruptionBehavior("radio/news", "car/fuel"), PopupState::Allow);
    QCOMPARE(store.getInterruptionBehavior("phone/call", "radio/news"), PopupState::Allow);
}

void tst_PopupInterruptionStore::theMostExactDefaultAnswers_data()
{
    QTest::addColumn<QByteArray>("json");
    QTest::addColumn<int>("answer");

    const QByteArray own = R"({"popup": "phone/call", "default": "Prohibit"})";
    const QByteArray ofAny = R"({"popup": "*/call", "default": "AllowStack"})";
    const QByteArray ofModule = R"({"popup": "phone/*", "default": "AllowNoReturn"})";
    QTest::newRow("none") << QByteArray("[]") << 1;
    QTest::newRow("own") << '[' + own + ']' << 0;
    QTest::newRow("of any module") << '[' + ofAny + ']' << 2;
    QTest::newRow("of the module") << '[' + ofModule + ']' << 3;
    QTest::newRow("own, of any module") << '[' + ofAny + ',' + own + ']' << 0;
    QTest::newRow("own, of the module") << '[' + ofModule + ',' + own + ']' << 0;
    QTest::newRow("of any module, of the module") << '[' + ofModule + ',' + ofAny + ']' << 2;
    QTest::newRow("all") << '[' + ofModule + ',' + ofAny + ',' + own + ']' << 0;
}

void tst_PopupInterruptionStore::theMostExactDefaultAnswers()
{
    QFETCH(QByteArray, json);
    PopupInterruptionStore store;

    QVERIFY(loadInterruptions(store, json));

    QTEST(static_cast<int>(store.getInterruptionBehavior("phone/call", "car/fuel")), "answer");
    QCOMPARE(store.getInterruptionBehavior("radio/news", "car/fuel"), PopupState::Allow);
}

void tst_PopupInterruptionStore::aRuleGoesBeforeADefault_data()
{
    QTest::addColumn<QString>("defaultOf");
    QTest::addColumn<QString>("ruleOf");
    QTest::addColumn<int>("known");
    QTest::addColumn<int>("unknown");

    for (const QString &defaultOf : {exact, anyCall, anyPhone}) {
        for (const QString &ruleOf : {exact, anyCall, anyPhone}) {
            const QByteArray tag = ("default of " + defaultOf + ", rule of " + ruleOf).toUtf8();
            QTest::newRow(tag.constData()) << defaultOf << ruleOf << 3 << 0;
        }
    }
}

void tst_PopupInterruptionStore::aRuleGoesBeforeADefault()
{
    QFETCH(QString, defaultOf);
    QFETCH(QString, ruleOf);
    PopupInterruptionStore store;
    QVERIFY(loadInterruptions(
        store, "[{\"popup\": \"" + defaultOf.toUtf8() + "\", \"default\": \"Prohibit\"}]"));

    store.insertInterruptionBehavior(PopupState::AllowNoReturn, ruleOf, "car/fuel");

    QTEST(static_cast<int>(store.getInterruptionBehavior("phone/call", "car/fuel")), "known");
    QTEST(static_cast<int>(store.getInterruptionBehavior("phone/call", "car/door")), "unknown");
}

void tst_PopupInterruptionStore::anExactEntryHidesTheRulesOfItsWildCards()
{
    PopupInterruptionStore store;
    store.insertInterruptionBehavior(PopupState::AllowStack, "*/call", "car/fuel");
    store.insertInterruptionBehavior(PopupState::AllowNoReturn, "phone/*", "car/fuel");
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::AllowStack);

    store.insertInterruptionBehavior(PopupState::Prohibit, "phone/call", "car/door");

    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Allow);
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/door"), PopupState::Prohibit);
    QCOMPARE(store.getInterruptionBehavior("phone/sms", "car/fuel"), PopupState::AllowNoReturn);
    QCOMPARE(store.getInterruptionBehavior("chat/call", "car/fuel"), PopupState::AllowStack);
}

void tst_PopupInterruptionStore::aHiddenWildCardLeavesItsDefault()
{
    PopupInterruptionStore store;
    const char json[] = R"([{"popup": "*/call", "default": "Prohibit",
        "interruptions": [{"target": "car/fuel", "behavior": "AllowStack"}]},
        {"popup": "phone/call",
        "interruptions": [{"target": "car/door", "behavior": "AllowNoReturn"}]}])";
    QVERIFY(loadInterruptions(store, json));

    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Prohibit);
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/door"), PopupState::AllowNoReturn);
    QCOMPARE(store.getInterruptionBehavior("chat/call", "car/fuel"), PopupState::AllowStack);
}

void tst_PopupInterruptionStore::anInvalidDefaultIsMinusOne()
{
    PopupInterruptionStore store;
    const char json[] = R"([{"popup": "phone/*", "default": "Prohibit"},
        {"popup": "phone/call", "default": "Allowed",
        "interruptions": [{"target": "car/fuel", "behavior": "AllowStack"}]}])";
    QVERIFY(loadInterruptions(store, json));

    QCOMPARE(static_cast<int>(store.getInterruptionBehavior("phone/call", "car/door")), -1);
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::AllowStack);
    QCOMPARE(store.getInterruptionBehavior("phone/sms", "car/door"), PopupState::Prohibit);
}

void tst_PopupInterruptionStore::namesThatWildCardsMeet_data()
{
    QTest::addColumn<QString>("entry");
    QTest::addColumn<QString>("name");
    QTest::addColumn<bool>("meets");

    QTest::newRow("the second of three parts") << "*/b"
                                               << "a/b/c" << true;
    QTest::newRow("the last of three parts") << "*/c"
                                             << "a/b/c" << false;
    QTest::newRow("two parts of three") << "*/b/c"
                                        << "a/b/c" << false;
    QTest::newRow("the first of three parts") << "a/*"
                                              << "a/b/c" << true;
    QTest::newRow("the first two of three parts") << "a/b/*"
                                                  << "a/b/c" << false;
    QTest::newRow("no module, by popup") << "*/b"
                                         << "/b" << true;
    QTest::newRow("no module, by module") << "/*"
                                          << "/b" << true;
    QTest::newRow("no popup, by popup") << "*/"
                                        << "a/" << true;
    QTest::newRow("no popup, by module") << "a/*"
                                         << "a/" << true;
    QTest::newRow("a slash alone, by popup") << "*/"
                                             << "/" << true;
    QTest::newRow("a slash alone, by module") << "/*"
                                              << "/" << true;
    QTest::newRow("both open is no wildcard for a name") << "*/*"
                                                         << "a/b" << false;
    QTest::newRow("both open by itself") << "*/*"
                                         << "*/*" << true;
    QTest::newRow("both open by a module wildcard") << "*/*"
                                                    << "a/*" << true;
    QTest::newRow("both open by a popup wildcard") << "*/*"
                                                   << "*/b" << true;
    QTest::newRow("no slash, exactly") << "call"
                                       << "call" << true;
    QTest::newRow("no slash, by popup") << "*/call"
                                        << "call" << false;
    QTest::newRow("no slash, by module") << "call/*"
                                         << "call" << false;
    QTest::newRow("a star alone") << "*"
                                  << "call" << false;
    QTest::newRow("a star alone for a name with a slash") << "*"
                                                          << "a/b" << false;
    QTest::newRow("part of a module") << "pho*"
                                      << "phone" << false;
    QTest::newRow("other capitals") << "*/Call"
                                    << "phone/call" << false;
    QTest::newRow("empty") << ""
                           << "" << true;
    QTest::newRow("empty for a name") << ""
                                      << "call" << false;
    QTest::newRow("empty for a name with a slash") << ""
                                                   << "a/b" << false;
}

void tst_PopupInterruptionStore::namesThatWildCardsMeet()
{
    QFETCH(QString, entry);
    QFETCH(QString, name);
    PopupInterruptionStore byPopup;
    PopupInterruptionStore byTarget;

    byPopup.insertInterruptionBehavior(PopupState::Prohibit, entry, "over there");
    byTarget.insertInterruptionBehavior(PopupState::Prohibit, "over here", entry);

    QTEST(byPopup.getInterruptionBehavior(name, "over there") == PopupState::Prohibit, "meets");
    QTEST(byTarget.getInterruptionBehavior("over here", name) == PopupState::Prohibit, "meets");
}

void tst_PopupInterruptionStore::anEmptyNameMeetsItsOwnEntryAlone()
{
    PopupInterruptionStore store;
    store.insertInterruptionBehavior(PopupState::Prohibit, "", "");

    QCOMPARE(store.getInterruptionBehavior("", ""), PopupState::Prohibit);
    QCOMPARE(store.getInterruptionBehavior(QString(), QString()), PopupState::Prohibit);
    QCOMPARE(store.getInterruptionBehavior("", "call"), PopupState::Allow);
    QCOMPARE(store.getInterruptionBehavior("call", ""), PopupState::Allow);
}

void tst_PopupInterruptionStore::aLaterRuleReplacesTheFormerOne()
{
    PopupInterruptionStore store;
    store.insertInterruptionBehavior(PopupState::Prohibit, "*/call", "car/*");

    store.insertInterruptionBehavior(PopupState::AllowStack, "*/call", "car/*");

    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::AllowStack);
}

void tst_PopupInterruptionStore::aWildCardMayBeAddedAfterALookup()
{
    PopupInterruptionStore store;
    store.insertInterruptionBehavior(PopupState::Prohibit, "radio/news", "car/fuel");
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::Allow);

    store.insertInterruptionBehavior(PopupState::AllowStack, "phone/*", "*/fuel");

    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::AllowStack);
}

void tst_PopupInterruptionStore::rulesGoByTheNamesOfTheStates()
{
    PopupInterruptionStore store;
    QState parent;
    PopupState *call = popupShownAs("view/call", "phone/call", &parent);
    PopupState *fuel = popupShownAs("view/fuel", "car/fuel", &parent);
    store.insertInterruptionBehavior(PopupState::AllowStack, "view/call", "view/fuel");
    QCOMPARE(store.getInterruptionBehavior(call, fuel), PopupState::Allow);

    store.insertInterruptionBehavior(PopupState::Prohibit, "phone/call", "car/fuel");

    QCOMPARE(store.getInterruptionBehavior(call, fuel), PopupState::Prohibit);
    QCOMPARE(store.getInterruptionBehavior(fuel, call), PopupState::Allow);
}

void tst_PopupInterruptionStore::blacklistsGoByThePopupViewIds()
{
    Journal journal;
    RecordingViewStateTarget layer(journal);
    layer.setDomains({{"media", 4}});
    PopupInterruptionStore store;
    const char json[] = R"([
        {"popup": "view/call", "domainBlacklist": ["media"], "viewBlacklist": ["Map"]},
        {"popup": "car/fuel", "domainBlacklist": ["media"], "viewBlacklist": ["Map"]}])";
    QVERIFY(loadInterruptions(store, json));
    QState parent;
    const PopupState *call = popupShownAs("view/call", "phone/call", &parent);
    const PopupState *fuel = popupShownAs("view/fuel", "car/fuel", &parent);

    QVERIFY(store.isBlockedByDomain(call, 4));
    QVERIFY(!store.isBlockedByDomain(call, 5));
    QVERIFY(store.isBlockedByView(call, "Map"));
    QVERIFY(!store.isBlockedByView(call, "Radio"));
    QVERIFY(!store.isBlockedByDomain(fuel, 4));
    QVERIFY(!store.isBlockedByView(fuel, "Map"));
}

void tst_PopupInterruptionStore::theMostExactBlacklistDecidesAlone_data()
{
    QTest::addColumn<QStringList>("keys");
    QTest::addColumn<int>("winner");

    for (const Entries &entries : popupEntries) {
        QTest::newRow(entries.tag) << entries.keys << entries.winner;
    }
}

void tst_PopupInterruptionStore::theMostExactBlacklistDecidesAlone()
{
    QFETCH(QStringList, keys);
    QFETCH(int, winner);
    Journal journal;
    RecordingViewStateTarget layer(journal);
    layer.setDomains({{"1", 1}, {"2", 2}, {"3", 3}});
    PopupInterruptionStore store;
    for (const auto &key : popupPositions) {
        if (keys.contains(key.first)) {
            const QByteArray list = "[\"" + QByteArray::number(key.second) + "\"]";
            QVERIFY(loadInterruptions(store,
                                      "[{\"popup\": \"" + key.first.toUtf8()
                                          + "\", \"domainBlacklist\": " + list
                                          + ", \"viewBlacklist\": " + list + "}]"));
        }
    }

    for (int position = 1; position <= 3; ++position) {
        const bool blocked = position == winner;
        QCOMPARE(store.isBlockedByDomain("phone/call", position), blocked);
        QCOMPARE(store.isBlockedByView("phone/call", QString::number(position)), blocked);
    }
}

void tst_PopupInterruptionStore::blacklistsAndRulesAreKeptApart()
{
    Journal journal;
    RecordingViewStateTarget layer(journal);
    layer.setDomains({{"media", 4}});
    PopupInterruptionStore store;

    const char json[] = R"([
        {"popup": "phone/call", "default": "Prohibit"},
        {"popup": "*/call", "domainBlacklist": ["media"]},
        {"popup": "phone/*", "viewBlacklist": ["Map"],
         "interruptions": [{"target": "car/fuel", "behavior": "AllowStack"}]}])";
    QVERIFY(loadInterruptions(store, json));

    // Each table is searched for itself: an entry hides another one only of its own kind.
    QVERIFY(store.isBlockedByDomain("phone/call", 4));
    QVERIFY(store.isBlockedByView("phone/call", "Map"));
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/fuel"), PopupState::AllowStack);
    QCOMPARE(store.getInterruptionBehavior("phone/call", "car/door"), PopupState::Prohibit);
}

void tst_PopupInterruptionStore::theActiveDomainAndViewAreThoseOfTheViewLayer()
{
    Journal journal;
    RecordingViewStateTarget layer(journal);
    layer.setDomains({{"media", 4}});
    PopupInterruptionStore store;
    const char json[] = R"([{"popup": "phone/call", "domainBlacklist": ["media"],
        "viewBlacklist": ["Map"]}])";
    QVERIFY(loadInterruptions(store, json));
    QState parent;
    const PopupState *call = popupShownAs("phone/call", "shown as phone/call", &parent);
    QVERIFY(!store.isBlockedByDomain("phone/call"));
    QVERIFY(!store.isBlockedByView("phone/call"));
    QVERIFY(!store.isBlockedByDomain(call));
    QVERIFY(!store.isBlockedByView(call));

    layer.setActiveDomain(4);
    layer.setActiveView("Map");

    QVERIFY(store.isBlockedByDomain("phone/call"));
    QVERIFY(store.isBlockedByView("phone/call"));
    QVERIFY(store.isBlockedByDomain(call));
    QVERIFY(store.isBlockedByView(call));
}

void tst_PopupInterruptionStore::withoutAViewLayerNothingActiveBlocks()
{
    Journal journal;
    PopupInterruptionStore store;
    {
        RecordingViewStateTarget layer(journal);
        layer.setDomains({{"media", 0}});
        const char json[] = R"([{"popup": "phone/call",
            "domainBlacklist": ["media"], "viewBlacklist": [""]}])";
        QVERIFY(loadInterruptions(store, json));
        QVERIFY(store.isBlockedByDomain("phone/call"));
        QVERIFY(store.isBlockedByView("phone/call"));
    }
    const PopupState call("phone/call", 1);

    QVERIFY(!store.isBlockedByDomain("phone/call"));
    QVERIFY(!store.isBlockedByView("phone/call"));
    QVERIFY(!store.isBlockedByDomain(&call));
    QVERIFY(!store.isBlockedByView(&call));
    QVERIFY(store.isBlockedByDomain(&call, 0));
    QVERIFY(store.isBlockedByView(&call, ""));
}

QTEST_GUILESS_MAIN(tst_PopupInterruptionStore)
#include "tst_popupinterruptionstore.moc"
