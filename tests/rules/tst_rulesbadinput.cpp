#include "badinput/files.h"
#include "badinput/program.h"

#include <QTemporaryDir>
#include <QtTest>

#include <sys/stat.h>

namespace {

QByteArray nested(int levels)
{
    return QByteArray(levels, '[') + QByteArray(levels, ']');
}

} // namespace

class tst_RulesBadInput : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void whatIsNoFileOfRulesIsRefused_data();
    void whatIsNoFileOfRulesIsRefused();
    void whatCannotBeReadIsRefused_data();
    void whatCannotBeReadIsRefused();
    void whatIsTooLongIsRefused_data();
    void whatIsTooLongIsRefused();
    void deepNestingIsReadAsFarAsTheLibraryDoes();
    void theStandardInputIsRead();
    void aNamedPipeIsRead_data();
    void aNamedPipeIsRead();
    void twoFilesThatContradictEachOtherAreAFinding();
    void faultsOfTheInventoryAreTold_data();
    void faultsOfTheInventoryAreTold();

private:
    QString path(const QString &name) const { return m_folder->filePath(name); }
    bool makePipe(const QString &name) const
    {
        return mkfifo(qPrintable(path(name)), S_IRUSR | S_IWUSR) == 0;
    }

    QScopedPointer<QTemporaryDir> m_folder;
};

void tst_RulesBadInput::init()
{
    m_folder.reset(new QTemporaryDir);
    QVERIFY(write(path("remark.json"), remark));
    QVERIFY(write(path("fine.json"), fine));
}

void tst_RulesBadInput::whatIsNoFileOfRulesIsRefused_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<QByteArray>("error");

    const auto add = [](const char *tag, const QByteArray &content, const QByteArray &error) {
        QTest::newRow(tag) << content << error;
    };
    add("empty", "", "1:1: error: not JSON: ");
    add("only space", "   ", "1:");
    add("a number", "42", "1:1: error: expected an array of entries, found a number");
    add("a text", "\n \"x\"", "2:2: error: expected an array of entries, found a text");
    add("no comma", "[{\"popup\": \"a\"\n \"default\": \"Allow\"}]", "2:");
    add("trailing comma", "[{},]", "1:5: error: not JSON: ");
    add("truncated", "[{\"popup\": \"a\"", "1:15: error: not JSON: ");
    add("text behind", "[]\nx", "2:1: error: not JSON: ");
    add("a number out of range", "[1e999]",
        "1:6: error: not JSON: number overflow parsing '1e999'");
    add("UTF-16", QByteArray("\xff\xfe[\0]\0", 6), "1:1: error: not UTF-8");
    add("UTF-16 without a mark", QByteArray("[\0]\0", 4),
        "1:2: error: not JSON: a byte of zero, as UTF-16 has them");
    add("Latin-1", "[{\"popup\": \"T\xfcr\"}]", "1:14: error: not UTF-8");
    add("1025 levels", nested(1025), "1:1025: error: not JSON: nested deeper than 1024 levels");
    add("a million levels", nested(1000000),
        "1:1025: error: not JSON: nested deeper than 1024 levels");
}

void tst_RulesBadInput::whatIsNoFileOfRulesIsRefused()
{
    QFETCH(QByteArray, content);
    QFETCH(QByteArray, error);
    QVERIFY(write(path("rules.json"), content));

    const Ended lint = Program(m_folder->path()).run({"lint", "rules.json"});

    QVERIFY(lint.isInTime);
    QCOMPARE(lint.exitCode, 2);
    QCOMPARE(lint.output, QByteArray());
    QVERIFY2(lint.errors.startsWith("rules.json:" + error), lint.errors);
    QVERIFY2(lint.errors.contains("\n    Remedy: "), lint.errors);
    for (const QStringList &arguments :
         {QStringList{"explain", "rules.json", "a", "b"}, QStringList{"matrix", "rules.json"},
          QStringList{"diff", "fine.json", "rules.json"}}) {
        const Ended other = Program(m_folder->path()).run(arguments);
        QCOMPARE(other.exitCode, 2);
        QCOMPARE(other.errors, lint.errors);
    }
}

void tst_RulesBadInput::whatCannotBeReadIsRefused_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("error");

    QTest::newRow("a folder") << "folder" << QByteArray("folder: error: this is a folder");
    QTest::newRow("missing") << "missing.json"
                             << QByteArray("missing.json: error: cannot be opened: No such file or "
                                           "directory");
    QTest::newRow("without permission")
        << "secret.json" << QByteArray("secret.json: error: cannot be opened: Permission denied");
}

void tst_RulesBadInput::whatCannotBeReadIsRefused()
{
    QFETCH(QString, name);
    QFETCH(QByteArray, error);
    QVERIFY(QDir(m_folder->path()).mkdir("folder"));
    QVERIFY(write(path("secret.json"), fine));
    QVERIFY(QFile::setPermissions(path("secret.json"), {}));

    const Ended ended = Program(m_folder->path()).run({"lint", name});

    QCOMPARE(ended.exitCode, 2);
    QCOMPARE(first(ended.errors), error);
    QVERIFY2(ended.errors.contains("\n    Remedy: "), ended.errors);
}

void tst_RulesBadInput::whatIsTooLongIsRefused_data()
{
    QTest::addColumn<QString>("name");

    QTest::newRow("a file with a hole") << "hole.json";
    QTest::newRow("an array") << "array.json";
    QTest::newRow("a device without an end") << "/dev/zero";
}

void tst_RulesBadInput::whatIsTooLongIsRefused()
{
    QFETCH(QString, name);
    constexpr int size = 100 * 1024 * 1024;
    QVERIFY(write(path("hole.json"), "["));
    QVERIFY(QFile::resize(path("hole.json"), size));
    const QByteArray entry = R"({"popup":"a","default":"Allow"},)";
    if (name == "array.json") {
        QVERIFY(write(path(name), '[' + entry.repeated(size / entry.size()) + "{}]"));
    }

    const Ended ended = Program(m_folder->path()).run({"lint", name});

    QVERIFY(ended.isInTime);
    QCOMPARE(ended.exitCode, 2);
    QCOMPARE(first(ended.errors), name.toUtf8() + ": error: longer than 16 MiB");
}

void tst_RulesBadInput::deepNestingIsReadAsFarAsTheLibraryDoes()
{
    for (const int levels : {1000, 1024}) {
        QVERIFY(write(path("rules.json"), nested(levels)));

        const Ended ended = Program(m_folder->path()).run({"lint", "rules.json"});

        QCOMPARE(ended.exitCode, 1);
        QVERIFY2(ended.output.contains("[invalid-entry]"), ended.output);
    }
}

void tst_RulesBadInput::theStandardInputIsRead()
{
    const Ended ended = Program(m_folder->path()).run({"lint", "-"}, remark);

    QCOMPARE(ended.exitCode, 1);
    QCOMPARE(first(ended.output),
             QByteArray("<standard input>:1:37: error: expected a behaviour, found \"Nein\" "
                        "[invalid-default]"));
}

void tst_RulesBadInput::aNamedPipeIsRead_data()
{
    QTest::addColumn<QString>("writer");
    QTest::addColumn<int>("exitCode");

    QTest::newRow("to its end") << "cat fine.json" << 0;
    QTest::newRow("in pieces") << "{ head -c 9 fine.json; cat /dev/null; tail -c +10 fine.json; }"
                               << 0;
    QTest::newRow("closed early") << "head -c 9 fine.json" << 2;
    QTest::newRow("closed at once") << "cat /dev/null" << 2;
}

void tst_RulesBadInput::aNamedPipeIsRead()
{
    QFETCH(QString, writer);
    QFETCH(int, exitCode);
    QVERIFY(makePipe("pipe"));

    const Ended ended =
        Program(m_folder->path()).runShell(writer + R"( > pipe & exec "$RULES" lint pipe)");

    QVERIFY(ended.isInTime);
    QCOMPARE(ended.exitCode, exitCode);
    QCOMPARE(ended.errors.startsWith("pipe:1:"), exitCode == 2);
}

void tst_RulesBadInput::twoFilesThatContradictEachOtherAreAFinding()
{
    const Ended ended =
        Program(m_folder->path())
            .run({"lint", "fine.json", "-"}, R"([{"popup":"phone/call","default":"Prohibit"}])");

    QCOMPARE(ended.exitCode, 1);
    QCOMPARE(
        first(ended.output),
        QByteArray("<standard input>:1:34: error: the default Prohibit of \"phone/call\" takes "
                   "the place of Allow in an earlier file [contradicting-files]"));
    QVERIFY2(ended.output.contains("    fine.json:1:37: this one is lost\n"), ended.output);
}

void tst_RulesBadInput::faultsOfTheInventoryAreTold_data()
{
    QTest::addColumn<QString>("option");
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<QByteArray>("error");

    const auto add = [](const char *tag, const char *option, const char *content,
                        const char *error) {
        QTest::newRow(tag) << option << QByteArray(content) << QByteArray(error);
    };
    const auto *const inventory = "--inventory";
    add("empty", inventory, "", "1:1: error: not JSON: ");
    add("no JSON", inventory, "{\"popups\"}", "1:10: error: not JSON: ");
    add("no object", inventory, "[]",
        "1:1: error: expected an object in the inventory, found an array");
    add("unknown key", inventory, R"({"popup": []})",
        R"(1:2: error: unknown key "popup" in the inventory)");
    add("popups no array", inventory, R"({"popups": "a"})",
        "1:12: error: expected an array in the inventory, found a text");
    add("a popup that is a number", inventory, R"({"popups": ["a", 5]})",
        "1:18: error: expected an object in the inventory, found a number");
    add("a popup without a name", inventory, R"({"popups": [{"viewId": "a"}]})",
        "1:13: error: a popup of the inventory without a name or with an empty view id");
    add("an empty name", inventory, R"({"popups": [""]})",
        "1:13: error: a popup of the inventory without a name or with an empty view id");
    add("unknown key of a popup", inventory, R"({"popups": [{"name": "a", "viewID": "b"}]})",
        R"(1:27: error: unknown key "viewID" of a popup in the inventory)");
    add("a domain that is null", inventory, R"({"domains": [null]})",
        "1:14: error: expected a text in the inventory, found null");
    add("views no array", inventory, R"({"views": {}})",
        "1:11: error: expected an array in the inventory, found an object");
    add("two view ids", inventory, R"({"popups": ["a", {"name": "a", "viewId": "b"}]})",
        R"(1:18: error: the popup "a" has the view id "b" here and "a" at list:1:13)");
    for (const char *option : {"--popups", "--domains", "--views"}) {
        add(option, option, "a\nb\xfc\n", "2:1: error: not UTF-8");
    }
}

void tst_RulesBadInput::faultsOfTheInventoryAreTold()
{
    QFETCH(QString, option);
    QFETCH(QByteArray, content);
    QFETCH(QByteArray, error);
    QVERIFY(write(path("list"), content));

    const Ended ended = Program(m_folder->path()).run({"lint", option, "list", "fine.json"});

    QCOMPARE(ended.exitCode, 2);
    QVERIFY2(ended.errors.startsWith("list:" + error), ended.errors);
    QVERIFY2(ended.errors.contains("\n    Remedy: "), ended.errors);
}

QTEST_GUILESS_MAIN(tst_RulesBadInput)
#include "tst_rulesbadinput.moc"
