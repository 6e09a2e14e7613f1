#include "librarytest.h"
#include "popupflow.h"

#include <QtTest>

using namespace HmiStateMachine;

namespace {

constexpr int phoneDomain = 1;

/** Popups whose popup view ids are their names; dismissed by these. */
struct Popups : PopupFlow
{
    Popups(MessageRecorder &messages, const QByteArray &rules, const QStringList &below,
           const QStringList &above = {})
        : PopupFlow(messages)
    {
        for (const QString &name : below) {
            popup(name, name);
        }
        for (const QString &name : above) {
            upperPopup(name, name);
        }
        target.setDomains({{"Phone", phoneDomain}});
        load(rules);
        start();
    }

    void dismiss(const QString &name) { request(name + "_Dismiss"); }

    static QString front()
    {
        const PopupState *popup = PopupState::getActivePopupState();
        return popup ? popup->name() : QString();
    }

    /** What became visible and invisible since the last time. */
    QStringList seen() { return take().filter(QRegularExpression("^requestPopup(Show|Hide)")); }
};

} // namespace

/** What docs/popup-rules.md says of returns and blacklists beyond the answers of the rules. */
class tst_PopupRulesScreen : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aStackedPopupThatProhibitsItselfStaysStackedUnseen();
    void aRuleForItselfLetsAStackedPopupReturn();
    void aStackedPopupIsLookedUpByItsPopupViewId();
    void aStackedPopupMakesAReturnGetLost();
    void aReturningPopupIsPutToTheRulesOfAnotherLayer();
    void dismissingAPopupOfAnotherLayerBringsBackTheOneBehindIt();
    void aViewOfTheListDoesNotRefuseARequest();
    void eitherBlacklistShowsWhatBothHaveHidden();
    void aRefusedRequestDoesNotComeWithItsDomain();
};

void tst_PopupRulesScreen::aStackedPopupThatProhibitsItselfStaysStackedUnseen()
{
    Popups flow(messages(),
                R"([{"popup": "own/call", "default": "Prohibit",
                   "interruptions": [{"target": "own/fuel", "behavior": "AllowStack"}]}])",
                {"own/call", "own/fuel", "own/note"});
    flow.request("own/call");
    flow.request("own/fuel");

    flow.dismiss("own/fuel");
    QCOMPARE(flow.front(), QString());
    QCOMPARE(flow.target.stackedPopups(), QStringList({"own/call"}));

    flow.request("own/note");
    flow.request("own/call");
    QCOMPARE(flow.front(), QString());
    flow.request("own/fuel");
    QCOMPARE(flow.front(), QString("own/fuel"));

    flow.dismiss("own/call");
    flow.request("own/note");
    QCOMPARE(flow.front(), QString("own/note"));
}

void tst_PopupRulesScreen::aRuleForItselfLetsAStackedPopupReturn()
{
    Popups flow(messages(),
                R"([{"popup": "self/call", "default": "Prohibit",
                   "interruptions": [{"target": "self/call", "behavior": "Allow"},
                                     {"target": "self/fuel", "behavior": "AllowStack"}]}])",
                {"self/call", "self/fuel"});
    flow.request("self/call");
    flow.request("self/fuel");

    flow.dismiss("self/fuel");

    QCOMPARE(flow.front(), QString("self/call"));
    QCOMPARE(flow.target.stackedPopups(), QStringList());
}

void tst_PopupRulesScreen::aStackedPopupIsLookedUpByItsPopupViewId()
{
    Popups flow(messages(),
                R"([{"popup": "viewed/call", "default": "Prohibit",
                   "interruptions": [{"target": "viewed/*", "behavior": "AllowStack"}]},
                  {"popup": "ViewedBanner",
                   "interruptions": [{"target": "viewed/note", "behavior": "Prohibit"}]}])",
                {"viewed/fuel", "viewed/note"});
    flow.popup("viewed/call", "ViewedBanner");
    flow.request("viewed/call");
    flow.request("viewed/fuel");

    flow.request("viewed/note");
    QCOMPARE(flow.front(), QString("viewed/fuel"));

    flow.dismiss("viewed/fuel");
    QCOMPARE(flow.front(), QString("viewed/call"));
}

void tst_PopupRulesScreen::aStackedPopupMakesAReturnGetLost()
{
    Popups flow(messages(),
                R"([{"popup": "lost/alert", "default": "AllowStack",
                   "interruptions": [{"target": "lost/call", "behavior": "Prohibit"}]}])",
                {"lost/call", "lost/note"}, {"lost/alert", "lost/speed"});
    flow.request("lost/call");
    flow.request("lost/note");
    flow.request("lost/alert");
    flow.request("lost/speed");

    flow.dismiss("lost/note");
    flow.dismiss("lost/speed");
    flow.dismiss("lost/alert");

    QCOMPARE(flow.front(), QString());
}

void tst_PopupRulesScreen::aReturningPopupIsPutToTheRulesOfAnotherLayer()
{
    Popups flow(messages(),
                R"([{"popup": "back/stacks", "default": "AllowStack"},
                  {"popup": "back/goes", "default": "AllowNoReturn"},
                  {"popup": "back/refuses", "default": "Prohibit"}])",
                {"back/call", "back/note"}, {"back/refuses", "back/stacks", "back/goes"});
    flow.request("back/call");
    const auto returnUnder = [&flow](const QString &alert) {
        flow.request("back/note");
        flow.request(alert);
        flow.dismiss("back/note");
    };

    returnUnder("back/refuses");
    QCOMPARE(flow.front(), QString("back/call"));
    flow.dismiss("back/refuses");

    returnUnder("back/stacks");
    QCOMPARE(flow.target.stackedPopups(), QStringList({"back/stacks"}));
    flow.dismiss("back/stacks");

    returnUnder("back/goes");
    QVERIFY(!PopupState::isStateActive("back/goes"));
    QCOMPARE(flow.front(), QString("back/call"));
}

void tst_PopupRulesScreen::dismissingAPopupOfAnotherLayerBringsBackTheOneBehindIt()
{
    Popups flow(messages(), R"([{"popup": "behind/note", "default": "AllowNoReturn"}])",
                {"behind/call", "behind/note"}, {"behind/alert"});
    flow.request("behind/call");
    flow.request("behind/note");
    flow.take();

    flow.request("behind/alert");

    QCOMPARE(flow.seen(),
             QStringList({"requestPopupShow behind/alert 1", "requestPopupHide behind/note true",
                          "requestPopupHide behind/note true", "requestPopupShow behind/call 1"}));
}

void tst_PopupRulesScreen::aViewOfTheListDoesNotRefuseARequest()
{
    Popups flow(messages(), R"([{"popup": "onview/traffic", "viewBlacklist": ["Map"]}])",
                {"onview/traffic"});
    flow.target.setActiveView("Map");

    flow.request("onview/traffic");
    QCOMPARE(flow.seen(), QStringList({"requestPopupShow onview/traffic 1"}));

    flow.target.setActiveView("Home");
    flow.seen();
    flow.target.setActiveView("Map");
    QCOMPARE(flow.seen(), QStringList({"requestPopupHide onview/traffic false"}));
}

void tst_PopupRulesScreen::eitherBlacklistShowsWhatBothHaveHidden()
{
    Popups flow(messages(),
                R"([{"popup": "both/advert", "domainBlacklist": ["Phone"],
                   "viewBlacklist": ["Map"]}])",
                {"both/advert"});
    flow.request("both/advert");
    flow.target.setActiveView("Map");
    flow.target.setActiveDomain(phoneDomain);
    flow.take();

    flow.target.setActiveDomain(0);

    QCOMPARE(flow.seen(), QStringList({"requestPopupShow both/advert 1"}));
}

void tst_PopupRulesScreen::aRefusedRequestDoesNotComeWithItsDomain()
{
    Popups flow(messages(), R"([{"popup": "wait/advert", "domainBlacklist": ["Phone"]}])",
                {"wait/advert"});
    flow.target.setActiveDomain(phoneDomain);
    flow.request("wait/advert");

    flow.target.setActiveDomain(0);

    QCOMPARE(flow.front(), QString());
    QCOMPARE(flow.seen(), QStringList());
}

QTEST_GUILESS_MAIN(tst_PopupRulesScreen)
#include "tst_popuprulesscreen.moc"
