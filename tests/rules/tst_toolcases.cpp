#include "goldens.h"

#include "lint/catalogue.h"
#include "report/json.h"
#include "version.h"

#include <QDir>
#include <QTest>

using namespace hmirules;

/**
 * What hmi-rules writes for the command lines in tests/rules/output: CASE.arguments, one argument a
 * line, and CASE.expected, with the errors behind the output and a last line "exit N". Of SARIF the
 * rules are left out, which are the list of findings.
 */
class tst_ToolCases : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void everyExpectedTextIsOfACase();
    void writesWhatIsExpected_data();
    void writesWhatIsExpected();
    void theSchemaIsThatOfTheSource();
    void thePageTellsAllFindings();
    void allFindingsAreEachOfThem();
};

namespace {

QString withoutVersion(QString text)
{
    return text.replace(QString("\"version\": \"%1\"").arg(toolVersion), "\"version\": \"...\"");
}

QString withoutSarifRules(const QString &text)
{
    if (!text.contains("sarif-2.1.0")) {
        return text;
    }
    OrderedJson json = OrderedJson::parse(text.toStdString());
    json["runs"][0]["tool"]["driver"].erase("rules");
    return dump(json);
}

} // namespace

void tst_ToolCases::initTestCase()
{
    qputenv("NO_COLOR", "1");
    QVERIFY(QDir::setCurrent(HMI_TEST_DATA_DIR)); // so that files go by their names
}

void tst_ToolCases::everyExpectedTextIsOfACase()
{
    for (const QString &file : QDir().entryList({"*.expected"}, QDir::Files)) {
        const QString name = file.section('.', 0, 0);
        QVERIFY2(QFile::exists(name + ".arguments"), qPrintable(name));
    }
}

void tst_ToolCases::writesWhatIsExpected_data()
{
    QTest::addColumn<QString>("name");
    const QStringList files = QDir().entryList({"*.arguments"}, QDir::Files, QDir::Name);
    QVERIFY(!files.isEmpty());
    for (const QString &file : files) {
        const QString name = file.section('.', 0, 0);
        QTest::newRow(qPrintable(name)) << name;
    }
}

void tst_ToolCases::writesWhatIsExpected()
{
    QFETCH(QString, name);

    ToolRun run = runTool(argumentsIn(name + ".arguments"));

    run.output = withoutSarifRules(withoutVersion(run.output));
    QCOMPARE(run.lines(), contentOf(name + ".expected").split('\n'));
}

void tst_ToolCases::theSchemaIsThatOfTheSource()
{
    const ToolRun run = runTool({"schema"});

    QCOMPARE(run.output, contentOf(HMI_RULES_SCHEMA));
    QCOMPARE(run.exitCode, 0);
}

void tst_ToolCases::thePageTellsAllFindings()
{
    const QString page = contentOf(HMI_POPUP_RULES_PAGE);
    const QString told =
        page.section("<!-- findings -->\n", 1).section("<!-- end of findings", 0, 0);

    const ToolRun run = runTool({"findings", "--format", "markdown"});

    // Printed by: hmi-rules findings --format markdown
    QCOMPARE(told.split('\n'), run.output.split('\n'));
}

void tst_ToolCases::allFindingsAreEachOfThem()
{
    QStringList texts;
    const QStringList ids = findingIds();
    for (const QString &id : ids) {
        texts.append(runTool({"findings", id}).output);
    }

    QCOMPARE(runTool({"findings"}).output, texts.join('\n'));
}

QTEST_GUILESS_MAIN(tst_ToolCases)
#include "tst_toolcases.moc"
