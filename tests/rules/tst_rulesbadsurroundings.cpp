#include "badinput/files.h"
#include "badinput/program.h"

#include <QTemporaryDir>
#include <QtTest>

#include <sys/stat.h>

namespace {

QByteArray readBack(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("unreadable");
}

} // namespace

class tst_RulesBadSurroundings : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void outputThatCannotBeWrittenIsAnError_data();
    void outputThatCannotBeWrittenIsAnError();
    void anExistingOutputIsKeptWhenSomethingFails_data();
    void anExistingOutputIsKeptWhenSomethingFails();
    void aPipeIsWrittenIntoAndStaysOne();
    void aReaderThatGoesEarlyEndsTheProgram();
    void closedStreamsAreErrors_data();
    void closedStreamsAreErrors();
    void noNameReachesTheTerminalAsACommand_data();
    void noNameReachesTheTerminalAsACommand();
    void rulesOfLoggingHideNoFinding();
    void theLocaleChangesNothing();
    void aMissingFolderForTemporaryFilesIsNamed_data();
    void aMissingFolderForTemporaryFilesIsNamed();

private:
    QString path(const QString &name) const { return m_folder->filePath(name); }

    QScopedPointer<QTemporaryDir> m_folder;
};

void tst_RulesBadSurroundings::init()
{
    m_folder.reset(new QTemporaryDir);
    QVERIFY(write(path("remark.json"), remark));
    QVERIFY(write(path("fine.json"), fine));
    // Escape sequences, line breaks, quotes and what turns the direction of writing are in its
    // names.
    QVERIFY(QFile::copy(HMI_TEST_DATA_DIR "/hostile.json", path("hostile.json")));
    QVERIFY(write(path("old.txt"), "old"));
    QVERIFY(QDir(m_folder->path()).mkdir("folder"));
}

void tst_RulesBadSurroundings::outputThatCannotBeWrittenIsAnError_data()
{
    QTest::addColumn<QString>("command");
    QTest::addColumn<QByteArray>("error");

    QTest::newRow("a missing folder")
        << "lint remark.json -o missing/out"
        << QByteArray("missing/out: error: cannot be written: No such file or directory");
    QTest::newRow("a folder")
        << "matrix fine.json -o folder"
        << QByteArray("folder: error: cannot be written: Filename refers to a directory");
    for (const char *command : {"lint remark.json", "matrix fine.json", "schema", "--help"}) {
        QTest::addRow("a full device behind the standard output of %s", command)
            << QString("%1 > /dev/full").arg(command)
            << QByteArray("<standard output>: error: cannot be written: No space left on device");
    }
}

void tst_RulesBadSurroundings::outputThatCannotBeWrittenIsAnError()
{
    QFETCH(QString, command);
    QFETCH(QByteArray, error);

    const Ended ended = Program(m_folder->path()).runShell("exec \"$RULES\" " + command);

    QCOMPARE(ended.exitCode, 2);
    QCOMPARE(first(ended.errors), error);
    QVERIFY2(ended.errors.contains("\n    Remedy: "), ended.errors);
}

void tst_RulesBadSurroundings::anExistingOutputIsKeptWhenSomethingFails_data()
{
    QTest::addColumn<QString>("arguments");

    QTest::newRow("lint") << "lint missing.json -o old.txt";
    QTest::newRow("explain") << "explain missing.json a b -o old.txt";
    QTest::newRow("matrix") << "matrix missing.json -o old.txt";
    QTest::newRow("diff") << "diff fine.json missing.json -o old.txt";
    QTest::newRow("inventory") << "lint --inventory missing.json fine.json -o old.txt";
    QTest::newRow("findings") << "findings missing -o old.txt";
    QTest::newRow("command line") << "lint fine.json -o old.txt --missing";
}

void tst_RulesBadSurroundings::anExistingOutputIsKeptWhenSomethingFails()
{
    QFETCH(QString, arguments);

    const Ended ended = Program(m_folder->path()).run(arguments.split(' '));

    QCOMPARE(ended.exitCode, 2);
    QVERIFY(!ended.errors.isEmpty());
    QCOMPARE(readBack(path("old.txt")), QByteArray("old"));
}

void tst_RulesBadSurroundings::aPipeIsWrittenIntoAndStaysOne()
{
    QVERIFY(mkfifo(qPrintable(path("pipe")), S_IRUSR | S_IWUSR) == 0);

    const Ended ended =
        Program(m_folder->path())
            .runShell(
                "cat pipe & \"$RULES\" lint remark.json -o pipe; result=$?; wait; exit $result");

    QVERIFY(ended.isInTime);
    QCOMPARE(ended.exitCode, 1);
    QVERIFY2(ended.output.startsWith("remark.json:1:37: error: "), ended.output);
    QVERIFY(!QFileInfo(path("pipe")).isFile());
}

void tst_RulesBadSurroundings::aReaderThatGoesEarlyEndsTheProgram()
{
    QByteArray rules = "[";
    for (int i = 0; i < 300; ++i) {
        rules += R"({"default":"Allow","popup":"m/)" + QByteArray::number(i) + "\"},";
    }
    QVERIFY(write(path("many.json"), rules + "{}]"));

    const Ended ended =
        Program(m_folder->path()).runShell("\"$RULES\" matrix many.json --format csv | head -n 1");

    QVERIFY(ended.isInTime);
    QCOMPARE(ended.errors, QByteArray());
    QVERIFY2(ended.output.startsWith("front,requested,"), ended.output);
}

void tst_RulesBadSurroundings::closedStreamsAreErrors_data()
{
    QTest::addColumn<QString>("command");
    QTest::addColumn<QByteArray>("error");

    const QByteArray unwritten = "<standard output>: error: cannot be written: Bad file descriptor";
    QTest::newRow("input") << "lint - <&-"
                           << QByteArray("<standard input>: error: cannot be read: Bad file "
                                         "descriptor");
    QTest::newRow("output") << "lint remark.json >&-" << unwritten;
    QTest::newRow("input and output") << "matrix fine.json <&- >&-" << unwritten;
    QTest::newRow("errors") << "lint missing.json 2>&-" << QByteArray();
    QTest::newRow("all") << "lint missing.json <&- >&- 2>&-" << QByteArray();
}

void tst_RulesBadSurroundings::closedStreamsAreErrors()
{
    QFETCH(QString, command);
    QFETCH(QByteArray, error);

    const Ended ended = Program(m_folder->path()).runShell("exec \"$RULES\" " + command);

    QVERIFY(ended.isInTime);
    QCOMPARE(ended.exitCode, 2);
    QCOMPARE(first(ended.errors), error);
    QCOMPARE(readBack(path("remark.json")), QByteArray(remark));
}

void tst_RulesBadSurroundings::noNameReachesTheTerminalAsACommand_data()
{
    QTest::addColumn<QStringList>("arguments");

    const QString popup = "\x1b[2Jphone/\ncall";
    QTest::newRow("lint") << QStringList{"lint", "hostile.json"};
    QTest::newRow("explain") << QStringList{"explain",  "hostile.json", popup,
                                            popup,      "--view",       "\x1b[1mview\u009b",
                                            "--domain", "\rd\u202e"};
    QTest::newRow("matrix") << QStringList{"matrix", "hostile.json"};
    QTest::newRow("diff") << QStringList{"diff", "fine.json", "hostile.json"};
    QTest::newRow("the name of a file") << QStringList{"lint", "\x1b[2J.json"};
    QTest::newRow("the command line") << QStringList{"\x1b[2J"};
}

void tst_RulesBadSurroundings::noNameReachesTheTerminalAsACommand()
{
    QFETCH(QStringList, arguments);

    const Ended ended = Program(m_folder->path()).run(arguments);

    const QString text = QString::fromUtf8(ended.output + ended.errors);
    QVERIFY(!text.isEmpty());
    for (const QChar c : text) {
        QVERIFY2(
            c == '\n'
                || (c.category() != QChar::Other_Control && c.category() != QChar::Other_Format),
            qPrintable(text));
    }
    QVERIFY2(text.contains("\\u001b[") || text.contains("\\x1b["), qPrintable(text));
}

void tst_RulesBadSurroundings::rulesOfLoggingHideNoFinding()
{
    QVERIFY(write(path("rules.json"), "[5]"));
    Program program(m_folder->path());
    program.setVariable("QT_LOGGING_RULES", "*=false");

    const Ended ended = program.run({"lint", "rules.json"});

    QCOMPARE(ended.exitCode, 1);
    QVERIFY2(ended.output.contains("[invalid-entry]"), ended.output);
}

void tst_RulesBadSurroundings::theLocaleChangesNothing()
{
    QVERIFY(write(path(u8"t\u00fcr.json"),
                  u8"[{\"popup\": \"t\u00fcr/\u4e2d\", \"default\": \"Nein\"}]"));
    for (const char *locale : {"C", "POSIX", "C.UTF-8"}) {
        Program program(m_folder->path());
        program.setVariable("LC_ALL", locale);

        const Ended ended = program.run({"explain", u8"t\u00fcr.json", u8"t\u00fcr/\u4e2d", "a"});

        QCOMPARE(ended.exitCode, 0);
        QVERIFY2(ended.output.startsWith(u8"\"t\u00fcr/\u4e2d\" is in front"), ended.output);
        QVERIFY2(ended.output.contains(u8"    t\u00fcr.json:1:"), ended.output);
    }
}

void tst_RulesBadSurroundings::aMissingFolderForTemporaryFilesIsNamed_data()
{
    QTest::addColumn<QString>("folder");
    QTest::addColumn<QString>("reason");

    QTest::newRow("missing") << "missing"
                             << "No such file or directory";
    QTest::newRow("without permission") << "folder"
                                        << "Permission denied";
}

void tst_RulesBadSurroundings::aMissingFolderForTemporaryFilesIsNamed()
{
    QFETCH(QString, folder);
    QFETCH(QString, reason);
    QVERIFY(QFile::setPermissions(path("folder"), QFile::ReadOwner | QFile::ExeOwner));
    Program program(m_folder->path());
    program.setVariable("TMPDIR", path(folder));

    const Ended ended = program.run({"lint", "fine.json"});

    QCOMPARE(ended.exitCode, 2);
    QCOMPARE(
        QString(ended.errors),
        QString("hmi-rules: error: no temporary file can be written in \"%1\" (%2); the variable "
                "TMPDIR of the environment names another folder\n")
            .arg(path(folder), reason));
}

QTEST_GUILESS_MAIN(tst_RulesBadSurroundings)
#include "tst_rulesbadsurroundings.moc"
