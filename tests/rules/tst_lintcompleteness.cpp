#include "goldens.h"

#include "lint/linter.h"

#include <QDir>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTest>

#include <sys/resource.h>
#include <unistd.h>

#include <memory>

using namespace hmirules;

/** Whatever the library warns of when it loads a file is a finding. */
class tst_LintCompleteness : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void eachWarningIsAFinding_data();
    void eachWarningIsAFinding();
    void whatTheLibraryCannotParseIsUnusable_data();
    void whatTheLibraryCannotParseIsUnusable();
    void aWarningOfAnotherSortIsAFinding();
};

namespace {

constexpr char parseError[] = "json parse error: ";

QString dataFile(const QString &name)
{
    return QStringLiteral(HMI_TEST_DATA_DIR "/") + name;
}

// A row for each file that the library can parse, or for each of the others.
void fileRows(bool canBeParsed)
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("warnings");
    const QStringList files = QDir(dataFile("")).entryList({"*.json"}, QDir::Files, QDir::Name);
    for (const QString &file : files) {
        const QString name = file.chopped(5);
        const QString warnings = contentOf(dataFile(name + ".expected"));
        if (warnings.contains(parseError) != canBeParsed) {
            QTest::newRow(qPrintable(name)) << name << warnings;
        }
    }
}

// "source 3" or "target 2 1": what is wrong, and its indexes.
QStringList faultsIn(const QString &warnings)
{
    QStringList faults;
    for (const QString &line : warnings.split('\n', Qt::SkipEmptyParts)) {
        faults.append(line.section("invalid ", 1).remove("at index: "));
    }
    faults.sort();
    return faults;
}

QStringList faultsFound(const QString &json)
{
    const QMap<QString, QString> words = {{"invalid-entry", "source"},
                                          {"missing-popup", "source"},
                                          {"invalid-target", "target"},
                                          {"invalid-behavior", "behavior"}};
    QStringList faults;
    const QJsonArray findings =
        QJsonDocument::fromJson(json.toUtf8()).object().value("findings").toArray();
    for (const QJsonValue &finding : findings) {
        const QString word = words.value(finding["id"].toString());
        const QStringList steps = finding["pointer"].toString().split('/');
        if (!word.isEmpty()) {
            const QString rule = word == "source" ? QString() : ' ' + steps.value(3);
            faults.append(word + ' ' + steps.value(1) + rule);
        }
    }
    faults.sort();
    return faults;
}

/** While it lives, the process can open one file at a time. */
class OneDescriptorLeft
{
public:
    OneDescriptorLeft()
    {
        const int next = dup(STDERR_FILENO);
        close(next);
        getrlimit(RLIMIT_NOFILE, &m_saved);
        const rlimit one = {static_cast<rlim_t>(next) + 1, m_saved.rlim_max};
        m_valid = next >= 0 && setrlimit(RLIMIT_NOFILE, &one) == 0;
    }
    ~OneDescriptorLeft() { setrlimit(RLIMIT_NOFILE, &m_saved); }

    bool isValid() const { return m_valid; }

private:
    Q_DISABLE_COPY(OneDescriptorLeft)

    rlimit m_saved = {};
    bool m_valid;
};

} // namespace

void tst_LintCompleteness::eachWarningIsAFinding_data()
{
    fileRows(true);
}

void tst_LintCompleteness::eachWarningIsAFinding()
{
    QFETCH(QString, name);
    QFETCH(QString, warnings);

    const ToolRun run = runTool({"lint", "--format", "json", dataFile(name + ".json")});

    QCOMPARE(faultsFound(run.output), faultsIn(warnings));
    QVERIFY(!run.output.contains("library-warning"));
    QCOMPARE(run.errors, QString());
}

void tst_LintCompleteness::whatTheLibraryCannotParseIsUnusable_data()
{
    fileRows(false);
}

void tst_LintCompleteness::whatTheLibraryCannotParseIsUnusable()
{
    QFETCH(QString, name);
    QFETCH(QString, warnings);

    const ToolRun run = runTool({"lint", dataFile(name + ".json")});

    QCOMPARE(run.exitCode, 2);
    QCOMPARE(run.output, QString());
    const QString reason = warnings.trimmed().section(parseError, 1);
    QVERIFY2(run.errors.contains("logs " + reason + '.'), qPrintable(run.errors));
}

// The library opens the file that the tool has written for it, and is short of descriptors.
void tst_LintCompleteness::aWarningOfAnotherSortIsAFinding()
{
    Fault fault;
    RuleFile file;
    QVERIFY(file.take("rules.json", "[]", &fault));
    std::unique_ptr<RuleBase> base;
    {
        const OneDescriptorLeft shortage;
        QVERIFY(shortage.isValid());
        base = std::make_unique<RuleBase>(std::vector<RuleFile>{file});
    }

    const std::vector<Finding> findings = lint(*base, Inventory(), 0, {});

    QCOMPARE(findings.size(), std::size_t(1));
    QCOMPARE(findings.front().kind->id, QString("library-warning"));
    QVERIFY2(findings.front().message.startsWith(
                 "the library warns: Invalid popup interruption file. \""),
             qPrintable(findings.front().message));
}

QTEST_GUILESS_MAIN(tst_LintCompleteness)
#include "tst_lintcompleteness.moc"
