#include "docgen/bashcompletion.h"

#include <QDir>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>
#include <QTest>

using namespace hmirules;

class tst_BashCompletion : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void theWordAtTheEndIsCompleted_data();
    void theWordAtTheEndIsCompleted();
    void findingsAreCompleted_data();
    void findingsAreCompleted();
    void theWordAtTheCursorIsCompleted();
    void theFunctionIsBoundToTheProgram();
    void aWordIsQuotedForTheShell_data();
    void aWordIsQuotedForTheShell();

private:
    QStringList bash(const QString &script, const QStringList &arguments);
    QStringList completed(const QStringList &words, const QString &completion = HMI_COMPLETION);

    QTemporaryDir m_directory; // with the files that are completed
};

namespace {

bool write(const QString &path, const QByteArray &text)
{
    QFile file(path);
    return file.open(QFile::WriteOnly) && file.write(text) == text.size();
}

QByteArray scriptTemplate()
{
    QFile file(HMI_COMPLETION_TEMPLATE);
    return file.open(QFile::ReadOnly) ? file.readAll() : QByteArray();
}

void row(const char *tag, const QStringList &words, const QStringList &completed)
{
    QTest::newRow(tag) << words << completed;
}

void valueRows()
{
    row("formats of lint", {"lint", "--format", ""}, {"text", "json", "sarif"});
    row("formats of matrix", {"matrix", "f", "--format", ""}, {"text", "csv", "html"});
    row("formats of findings", {"findings", "--format", "m"}, {"markdown"});
    row("a format behind =", {"lint", "--format", "=", "s"}, {"sarif"});
    row("formats right behind =", {"diff", "--format", "="}, {"text", "json"});
    row("severities", {"lint", "--fail-on", ""}, {"note", "warning", "error"});
    row("colours", {"lint", "--base", "x", "--color", "a"}, {"auto", "always"});
    row("findings of lint", {"lint", "--ignore", "unknown-"},
        {"unknown-key", "unknown-popup", "unknown-domain", "unknown-view"});
    row("a finding", {"findings", "shadowed-w"}, {"shadowed-wildcard"});
    row("a file of an option", {"lint", "--base", "pl"}, {"plain.json"});
    row("a file of a letter", {"schema", "-o", "pl"}, {"plain.json"});
    row("a value that no file of the machine has", {"explain", "f", "--domain", ""}, {});
    row("a popup", {"matrix", "f", "--only", "p"}, {});
}

void argumentRows()
{
    row("a file with a blank", {"lint", "my fi"}, {"my file.json"});
    row("a file and a folder", {"lint", "my"}, {"my file.json", "my folder"});
    row("a file in a folder", {"lint", "my folder/"}, {"my folder/inner.json"});
    row("a file with a quote", {"lint", "it"}, {"it's.json"});
    row("a file with a hyphen, behind --", {"lint", "--", "-h"}, {"-hyphen.json"});
    row("no file of the name", {"lint", "none"}, {});
    row("a further file", {"lint", "a", "b", "pl"}, {"plain.json"});
    row("a file behind an option", {"lint", "--base", "b", "--format", "=", "json", "pl"},
        {"plain.json"});
    row("a file behind a flag", {"matrix", "--blocking", "pl"}, {"plain.json"});
    row("no second file of the matrix", {"matrix", "a", "pl"}, {});
    row("a second file of diff", {"diff", "a", "pl"}, {"plain.json"});
    row("no third file of diff", {"diff", "a", "b", "pl"}, {});
    row("the file of explain", {"explain", "pl"}, {"plain.json"});
    row("no file for a popup", {"explain", "a", "pl"}, {});
    row("no argument of schema", {"schema", "pl"}, {});
    row("the standard input counts as a file", {"diff", "-", "b", "pl"}, {});
}

} // namespace

void tst_BashCompletion::initTestCase()
{
    const QDir directory(m_directory.path());
    QVERIFY(directory.mkdir("my folder"));
    for (const char *name :
         {"plain.json", "my file.json", "it's.json", "-hyphen.json", "my folder/inner.json"}) {
        QVERIFY(write(directory.filePath(name), "[]"));
    }
}

// What the script prints, by lines.
QStringList tst_BashCompletion::bash(const QString &script, const QStringList &arguments)
{
    QProcess process;
    process.setWorkingDirectory(m_directory.path());
    process.setProcessChannelMode(QProcess::MergedChannels);
    process.start(HMI_TEST_BASH,
                  QStringList({"--norc", "--noprofile", "-c", script, "bash"}) + arguments);
    if (!process.waitForFinished() || process.exitCode() != 0) {
        return {"bash failed: " + process.errorString() + process.readAll()};
    }
    return QString::fromUtf8(process.readAll()).split('\n', Qt::SkipEmptyParts);
}

QStringList tst_BashCompletion::completed(const QStringList &words, const QString &completion)
{
    return bash(R"(source "$1" || exit
                   COMP_WORDS=(hmi-rules "${@:2}") COMP_CWORD=$(($# - 1))
                   _hmi_rules
                   printf '%s\n' "${COMPREPLY[@]}")",
                QStringList({completion}) + words);
}

void tst_BashCompletion::theWordAtTheEndIsCompleted_data()
{
    QTest::addColumn<QStringList>("words");
    QTest::addColumn<QStringList>("expected");
    row("commands", {""}, {"lint", "explain", "matrix", "diff", "schema", "findings"});
    row("the beginning of a command", {"ma"}, {"matrix"});
    row("options without a command", {"-"}, {"-h", "--help", "--version"});
    row("a command behind an option", {"--help", "d"}, {"diff"});
    row("no command of the name", {"x"}, {});
    row("options", {"schema", "-"}, {"-o", "--output", "-h", "--help", "--version"});
    row("options of a beginning", {"lint", "f", "--f"}, {"--format", "--fail-on"});
    row("options of an unknown command", {"x", "--v"}, {"--version"});
    row("arguments of an unknown command", {"x", ""}, {});
    valueRows();
    argumentRows();
}

void tst_BashCompletion::theWordAtTheEndIsCompleted()
{
    QFETCH(QStringList, words);
    QFETCH(QStringList, expected);

    QStringList found = completed(words);

    if (found.contains("my folder")) {
        found.sort(); // a folder is read in no order
    }
    QCOMPARE(found, expected);
}

void tst_BashCompletion::findingsAreCompleted_data()
{
    QTest::addColumn<QStringList>("words");
    QTest::addColumn<QStringList>("expected");
    row("ignored", {"lint", "--ignore", ""}, {"first-one", "second", "it's $(dangerous) *"});
    row("ignored, the beginning", {"lint", "--ignore", "fi"}, {"first-one"});
    row("explained", {"findings", "s"}, {"second"});
    row("only one is explained", {"findings", "second", "f"}, {});
    row("with a quote", {"findings", "it"}, {"it's $(dangerous) *"});
}

void tst_BashCompletion::findingsAreCompleted()
{
    QFETCH(QStringList, words);
    QFETCH(QStringList, expected);
    const QString path = m_directory.filePath("completion");
    QVERIFY(write(path,
                  bashCompletion(program(), scriptTemplate(),
                                 {"first-one", "second", "it's $(dangerous) *"})));

    QCOMPARE(completed(words, path), expected);
}

void tst_BashCompletion::theWordAtTheCursorIsCompleted()
{
    const QStringList found = bash(R"(source "$1" || exit
                                      COMP_WORDS=(hmi-rules lint --co --base x) COMP_CWORD=2
                                      _hmi_rules
                                      printf '%s\n' "${COMPREPLY[@]}")",
                                   {HMI_COMPLETION});

    QCOMPARE(found, QStringList({"--color"}));
}

void tst_BashCompletion::theFunctionIsBoundToTheProgram()
{
    QCOMPARE(bash(R"(source "$1" && complete -p hmi-rules)", {HMI_COMPLETION}),
             QStringList({"complete -F _hmi_rules hmi-rules"}));
}

void tst_BashCompletion::aWordIsQuotedForTheShell_data()
{
    QTest::addColumn<QByteArray>("word");
    QTest::addColumn<QByteArray>("expected");
    QTest::newRow("plain") << QByteArray("a-b") << QByteArray("'a-b'");
    QTest::newRow("empty") << QByteArray("") << QByteArray("''");
    QTest::newRow("a quote") << QByteArray("a'b") << QByteArray(R"('a'\''b')");
    QTest::newRow("a substitution") << QByteArray("$(a) `b`") << QByteArray("'$(a) `b`'");
}

void tst_BashCompletion::aWordIsQuotedForTheShell()
{
    QFETCH(QByteArray, word);
    QFETCH(QByteArray, expected);

    QCOMPARE(shellQuoted(word), expected);
    QCOMPARE(bash("printf '%s' " + shellQuoted(word), {}).join('\n'), QString(word));
}

QTEST_GUILESS_MAIN(tst_BashCompletion)
#include "tst_bashcompletion.moc"
