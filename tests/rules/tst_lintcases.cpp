#include "goldens.h"

#include "lint/catalogue.h"

#include <QDir>
#include <QTest>

#include <algorithm>

/**
 * What "hmi-rules lint" says of the files in tests/rules/lint, all of which are listed:
 *
 * - CASE.json is checked, after it CASE.second.json and CASE.third.json where these are there,
 * - CASE.base.json is given as --base, CASE.inventory.json as --inventory,
 * - CASE.options holds further arguments, one a line,
 * - CASE.expected is what is written, to the standard error too, and a last line "exit N".
 */
class tst_LintCases : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void everyFileBelongsToACase();
    void saysWhatIsExpected_data();
    void saysWhatIsExpected();
    void everyFindingHasACase_data();
    void everyFindingHasACase();

private:
    QStringList m_cases;
};

namespace {

const QString partSuffixes[] = {".base.json", ".inventory.json", ".second.json", ".third.json",
                                ".options",   ".expected",       ".json"};

// The case that a file belongs to; empty when it has none of the names above.
QString caseOf(const QString &file)
{
    for (const QString &suffix : partSuffixes) {
        if (file.endsWith(suffix)) {
            return file.chopped(suffix.size());
        }
    }
    return QString();
}

QStringList argumentsOf(const QString &name)
{
    QStringList arguments = {"lint"};
    arguments += argumentsIn(name + ".options");
    for (const QString &option : {QString("base"), QString("inventory")}) {
        const QString file = name + '.' + option + ".json";
        if (QFile::exists(file)) {
            arguments += QStringList({"--" + option, file});
        }
    }
    arguments += name + ".json";
    for (const char *later : {".second.json", ".third.json"}) {
        if (QFile::exists(name + later)) {
            arguments += name + later;
        }
    }
    return arguments;
}

} // namespace

void tst_LintCases::initTestCase()
{
    qputenv("NO_COLOR", "1");
    QVERIFY(QDir::setCurrent(HMI_TEST_DATA_DIR)); // so that files go by their names
    for (const QString &file : QDir().entryList(QDir::Files, QDir::Name)) {
        m_cases.append(caseOf(file));
    }
    m_cases.removeDuplicates();
    QVERIFY(!m_cases.isEmpty());
}

void tst_LintCases::everyFileBelongsToACase()
{
    QVERIFY(!m_cases.contains(QString()));
    for (const QString &name : qAsConst(m_cases)) {
        QVERIFY2(QFile::exists(name + ".json"), qPrintable(name));
        QVERIFY2(QFile::exists(name + ".expected"), qPrintable(name));
    }
}

void tst_LintCases::saysWhatIsExpected_data()
{
    QTest::addColumn<QString>("name");
    for (const QString &name : qAsConst(m_cases)) {
        QTest::newRow(qPrintable(name)) << name;
    }
}

void tst_LintCases::saysWhatIsExpected()
{
    QFETCH(QString, name);

    const ToolRun run = runTool(argumentsOf(name));

    QCOMPARE(run.lines(), contentOf(name + ".expected").split('\n'));
}

void tst_LintCases::everyFindingHasACase_data()
{
    QTest::addColumn<QString>("id");
    for (const QString &id : hmirules::findingIds()) {
        // No file leads to it; tst_lintcompleteness provokes one.
        if (id != "library-warning") {
            QTest::newRow(qPrintable(id)) << id;
        }
    }
}

void tst_LintCases::everyFindingHasACase()
{
    QFETCH(QString, id);

    // The case of that name, so that it is found.
    const QStringList lines = contentOf(id + ".expected").split('\n');
    QVERIFY(std::any_of(lines.cbegin(), lines.cend(),
                        [&id](const QString &line) { return line.endsWith('[' + id + ']'); }));
}

QTEST_GUILESS_MAIN(tst_LintCases)
#include "tst_lintcases.moc"
