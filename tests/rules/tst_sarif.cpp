#include "goldens.h"

#include <QDir>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTest>
#include <QUrl>

/** Whether reports are what SARIF 2.1.0 demands and its readers rely on. */
class tst_Sarif : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void hasWhatReadersNeed_data();
    void hasWhatReadersNeed();
    void rulesAreTheFindings();
    void aPathIsAUriReference_data();
    void aPathIsAUriReference();

private:
    void checkNotifications(const QJsonObject &run);
    void checkResult(const QJsonObject &result, const QJsonArray &rules);
    void checkLocation(const QJsonValue &location);
};

namespace {

const QStringList levels = {"none", "note", "warning", "error"};

QJsonObject reportOf(const QStringList &arguments)
{
    const ToolRun run = runTool(QStringList({"lint", "--format", "sarif"}) + arguments);
    return QJsonDocument::fromJson(run.output.toUtf8()).object();
}

QJsonObject runOf(const QJsonObject &report)
{
    return report["runs"].toArray().first().toObject();
}

} // namespace

void tst_Sarif::initTestCase()
{
    QVERIFY(QDir::setCurrent(HMI_TEST_DATA_DIR));
}

void tst_Sarif::hasWhatReadersNeed_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<int>("results");
    QTest::addColumn<bool>("successful");
    QTest::newRow("several findings")
        << QStringList({"--inventory", "several.inventory.json", "several.json"}) << 9 << true;
    QTest::newRow("at the beginning") << QStringList("inventory.json") << 1 << true;
    QTest::newRow("several files")
        << QStringList({"--base", "rules.json", "rules-new.json", "name with blanks & é#1.json"})
        << 1 << true;
    QTest::newRow("nothing") << QStringList({"--ignore", "refuses-own-return", "before.json"}) << 0
                             << true;
    QTest::newRow("unusable") << QStringList({"unusable.json", "no such file.json"}) << 0 << false;
    QTest::newRow("by themselves")
        << QStringList({"--each", "unusable.json", "several.json", "several.json"}) << 10 << false;
}

void tst_Sarif::hasWhatReadersNeed()
{
    QFETCH(QStringList, arguments);
    QFETCH(int, results);
    QFETCH(bool, successful);

    const QJsonObject report = reportOf(arguments);

    QCOMPARE(report["version"].toString(), QString("2.1.0"));
    QCOMPARE(report["runs"].toArray().size(), 1);
    const QJsonObject run = runOf(report);
    QCOMPARE(run["tool"]["driver"]["name"].toString(), QString("hmi-rules"));
    QVERIFY(run["results"].isArray());
    QCOMPARE(run["results"].toArray().size(), results);
    for (const QJsonValue &result : run["results"].toArray()) {
        checkResult(result.toObject(), run["tool"]["driver"]["rules"].toArray());
    }
    QCOMPARE(run["invocations"][0]["executionSuccessful"].toBool(), successful);
    checkNotifications(run);
}

void tst_Sarif::checkNotifications(const QJsonObject &run)
{
    const QJsonArray notifications = run["invocations"][0]["toolExecutionNotifications"].toArray();
    QCOMPARE(notifications.isEmpty(), run["invocations"][0]["executionSuccessful"].toBool());
    for (const QJsonValue &notification : notifications) {
        QVERIFY(levels.contains(notification["level"].toString()));
        QVERIFY(!notification["message"]["text"].toString().isEmpty());
        checkLocation(notification["locations"][0]);
    }
}

void tst_Sarif::checkResult(const QJsonObject &result, const QJsonArray &rules)
{
    QVERIFY(!result["message"]["text"].toString().isEmpty());
    QVERIFY(levels.contains(result["level"].toString()));
    const QJsonValue rule = rules.at(result["ruleIndex"].toInt(-1));
    QCOMPARE(rule["id"].toString(), result["ruleId"].toString());
    QVERIFY(!result["ruleId"].toString().isEmpty());
    QCOMPARE(rule["defaultConfiguration"]["level"], result["level"]);
    QCOMPARE(result["locations"].toArray().size(), 1);
    checkLocation(result["locations"][0]);
    int id = 0;
    for (const QJsonValue &related : result["relatedLocations"].toArray()) {
        QCOMPARE(related["id"].toInt(-1), id++);
        QVERIFY(!related["message"]["text"].toString().isEmpty());
        checkLocation(related);
    }
}

void tst_Sarif::checkLocation(const QJsonValue &location)
{
    const QJsonValue physical = location["physicalLocation"];
    const QString uri = physical["artifactLocation"]["uri"].toString();
    const QUrl url(uri, QUrl::StrictMode);
    QVERIFY2(url.isValid() && url.isRelative() && !url.hasFragment() && !url.hasQuery(),
             qPrintable(uri));
    QVERIFY2(!uri.contains(' '), qPrintable(uri));
    const QJsonValue region = physical["region"];
    if (!region.isUndefined()) {
        QVERIFY(region["startLine"].toInt() >= 1);
        QVERIFY(region["startColumn"].toInt() >= 1);
    }
}

void tst_Sarif::rulesAreTheFindings()
{
    const QJsonObject run = runOf(reportOf({"several.json"}));

    QStringList texts;
    for (const QJsonValue &rule : run["tool"]["driver"]["rules"].toArray()) {
        texts.append(
            QString("%1 (%2): %3\n    On the target: %4\n    Remedy: %5\n")
                .arg(rule["id"].toString(), rule["defaultConfiguration"]["level"].toString(),
                     rule["shortDescription"]["text"].toString(),
                     rule["fullDescription"]["text"].toString(), rule["help"]["text"].toString()));
    }
    QCOMPARE(texts.join('\n').split('\n'), runTool({"findings"}).output.split('\n'));
}

void tst_Sarif::aPathIsAUriReference_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("uri");
    QTest::newRow("name") << "unusable.json"
                          << "unusable.json";
    QTest::newRow("folders") << "../output/unusable.json"
                             << "../output/unusable.json";
    QTest::newRow("blanks and letters") << "a b/é.json"
                                        << "a%20b/%C3%A9.json";
    QTest::newRow("what has a meaning in a URI") << "50%#1?:2.json"
                                                 << "50%25%231%3F%3A2.json";
    QTest::newRow("absolute") << "/no such folder/a.json"
                              << "file:///no%20such%20folder/a.json";
}

void tst_Sarif::aPathIsAUriReference()
{
    QFETCH(QString, path);

    const QJsonObject run = runOf(reportOf({path}));

    QTEST(run["invocations"][0]["toolExecutionNotifications"][0]["locations"][0]["physicalLocation"]
             ["artifactLocation"]["uri"]
                 .toString(),
          "uri");
}

QTEST_GUILESS_MAIN(tst_Sarif)
#include "tst_sarif.moc"
