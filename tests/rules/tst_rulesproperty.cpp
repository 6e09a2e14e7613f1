#include "random/decisioncase.h"
#include "random/rulemaker.h"

#include "lint/linter.h"

#include <QtTest>

using namespace HmiStateMachine;
using namespace hmirules;

namespace {

constexpr int defaultRuns = 60;

int warningCount = 0;

void countWarnings(QtMsgType, const QMessageLogContext &context, const QString &)
{
    warningCount += qstrcmp(context.category, "vosk.hmistatemachine") == 0 ? 1 : 0;
}

// What a person takes a file without any finding to say, without wildcards being made out.
QString unansweredEntry(const WrittenEntry &entry, const PopupInterruptionStore &store)
{
    for (const auto &rule : entry.rules) {
        if (store.getInterruptionBehavior(entry.popup, rule.first)
            != behaviorFromString(rule.second)) {
            return rule.first + " of " + entry.popup;
        }
    }
    if (!entry.defaultBehavior.isEmpty()
        && store.getInterruptionBehavior(entry.popup, "nobody's popup")
            != behaviorFromString(entry.defaultBehavior)) {
        return "default of " + entry.popup;
    }
    for (const QString &domain : entry.domains) {
        if (!isBlocked(store, entry.popup, domain, Site::DomainBlacklist)) {
            return domain + " of " + entry.popup;
        }
    }
    for (const QString &view : entry.views) {
        if (!isBlocked(store, entry.popup, view, Site::ViewBlacklist)) {
            return view + " of " + entry.popup;
        }
    }
    return QString();
}

} // namespace

class tst_RulesProperty : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void everyAnswerIsTheStoresAndItsSiteDecides_data();
    void everyAnswerIsTheStoresAndItsSiteDecides();
    void siteOfAnOddFileDecides_data();
    void siteOfAnOddFileDecides();
    void everyWarningIsOneFinding_data();
    void everyWarningIsOneFinding();
    void aFileWithoutFindingsSaysWhatItSeemsToSay_data();
    void aFileWithoutFindingsSaysWhatItSeemsToSay();
};

void tst_RulesProperty::initTestCase()
{
    qInstallMessageHandler(countWarnings);
}

void tst_RulesProperty::everyAnswerIsTheStoresAndItsSiteDecides_data()
{
    addSeedRows();
}

void tst_RulesProperty::everyAnswerIsTheStoresAndItsSiteDecides()
{
    QFETCH(quint32, seed);
    Random random(seed);
    const int runs = numberOfSteps(defaultRuns);

    for (int run = 1; run <= runs; ++run) {
        const QList<QByteArray> contents = randomFiles(&random, 3);
        const DecisionCase tried(contents);

        QVERIFY2(tried.isUsable(), reproduction(seed, run, "reading", contents));
        const QString wrong = tried.firstWrong();
        QVERIFY2(wrong.isEmpty(), reproduction(seed, run, wrong, contents));
    }
}

void tst_RulesProperty::siteOfAnOddFileDecides_data()
{
    QTest::addColumn<QByteArray>("content");

    QTest::newRow("a number as default")
        << QByteArray(R"([{"popup":"a","default":5},{"popup":"b/c","default":"Prohibit"}])");
    QTest::newRow("a number before a bracket")
        << QByteArray(R"([{"popup":"a","default":"Allow","viewBlacklist":["v",5]}])");
    QTest::newRow("an escaped byte order mark in front of a name")
        << QByteArray(R"([{"popup":"\ufeffa/b","default":"Prohibit"}])");
    QTest::newRow("a byte order mark in front of a name")
        << QByteArray("[{\"popup\":\"\xef\xbb\xbf"
                      R"(a/b","default":"Prohibit"}])");
    QTest::newRow("a byte order mark in front of a key")
        << QByteArray(R"([{"popup":"a","\ufeffpopup":"b","default":"Prohibit"}])");
}

void tst_RulesProperty::siteOfAnOddFileDecides()
{
    QFETCH(QByteArray, content);

    const DecisionCase tried({content});

    QVERIFY(!tried.base().sites().empty());
    QCOMPARE(tried.firstWrong(), QString());
}

void tst_RulesProperty::everyWarningIsOneFinding_data()
{
    addSeedRows();
}

void tst_RulesProperty::everyWarningIsOneFinding()
{
    QFETCH(quint32, seed);
    const QStringList ids = {"invalid-entry", "missing-popup", "invalid-target", "invalid-behavior",
                             "library-warning"};
    Random random(seed);
    const int runs = numberOfSteps(defaultRuns);

    for (int run = 1; run <= runs; ++run) {
        const QList<QByteArray> contents = randomFiles(&random, 3);
        const RuleBase base(filesOf(contents));
        warningCount = 0;
        QVERIFY(loaded(contents));

        const auto findings = lint(base, Inventory(), 0, {});

        const auto found = std::count_if(findings.cbegin(), findings.cend(), [&ids](const auto &f) {
            return ids.contains(f.kind->id);
        });
        QVERIFY2(found == warningCount, reproduction(seed, run, QString::number(found), contents));
    }
}

void tst_RulesProperty::aFileWithoutFindingsSaysWhatItSeemsToSay_data()
{
    addSeedRows();
}

void tst_RulesProperty::aFileWithoutFindingsSaysWhatItSeemsToSay()
{
    QFETCH(quint32, seed);
    constexpr int oddness = 25;
    Random random(seed);
    RuleMaker maker(&random, oddness);
    constexpr int filesInRun = 20; // most have findings
    const int files = filesInRun * numberOfSteps(defaultRuns);
    int clean = 0;

    for (int file = 0; file < files; ++file) {
        const QByteArray content = maker.file(3);
        if (!lint(RuleBase(filesOf({content})), Inventory(), 0, {}).empty()) {
            continue;
        }
        const auto store = loaded({content});
        for (const WrittenEntry &entry : maker.entries()) {
            ++clean;
            const QString wrong = unansweredEntry(entry, *store);
            QVERIFY2(wrong.isEmpty(), reproduction(seed, 1 + file / filesInRun, wrong, {content}));
        }
    }

    QVERIFY(clean > files / 20);
}

QTEST_GUILESS_MAIN(tst_RulesProperty)
#include "tst_rulesproperty.moc"
