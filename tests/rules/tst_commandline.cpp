#include "commandline/commandline.h"
#include "optiontext.h"

#include <QTest>

using namespace hmirules;
using Arguments = std::vector<std::string>;
Q_DECLARE_METATYPE(Arguments)

class tst_CommandLine : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void argumentsBecomeOptions_data();
    void argumentsBecomeOptions();
    void aFileKeepsTheBytesOfItsName();
    void aNameIsReadAsUtf8();
};

namespace {

void commandRows()
{
    QTest::newRow("lint") << Arguments{"lint", "a"} << "command=lint files=a";
    QTest::newRow("lint, several files")
        << Arguments{"lint", "a", "b", "a"} << "command=lint files=a,b,a";
    QTest::newRow("explain") << Arguments{"explain", "a", "p/q", "t/u"}
                             << "command=explain files=a front=p/q requested=t/u";
    QTest::newRow("matrix") << Arguments{"matrix", "a"} << "command=matrix files=a";
    QTest::newRow("diff") << Arguments{"diff", "old", "new"} << "command=diff files=old,new";
    QTest::newRow("schema") << Arguments{"schema"} << "command=schema";
    QTest::newRow("findings") << Arguments{"findings"} << "command=findings";
    QTest::newRow("findings, one")
        << Arguments{"findings", "some-id"} << "command=findings finding=some-id";
}

// The options that lint, explain, matrix and diff have in common.
void sharedRows()
{
    const std::vector<std::pair<Arguments, const char *>> commands = {
        {{"lint", "f"}, "command=lint files=f"},
        {{"explain", "f", "p", "t"}, "command=explain files=f"},
        {{"matrix", "f"}, "command=matrix files=f"},
        {{"diff", "f", "g"}, "command=diff files=f,g"},
    };
    for (const auto &[start, text] : commands) {
        Arguments arguments = start;
        arguments.insert(arguments.end(),
                         {"--base", "b", "--inventory=i", "--popups", "p.txt", "--base", "c",
                          "--domains", "d.txt", "--views", "v.txt", "-o", "out", "--color",
                          "never"});
        const bool explains = start.front() == "explain";
        QTest::addRow("%s, shared options", start.front().c_str())
            << arguments
            << QString(text) + " base=b,c inventory=i popups=p.txt domains=d.txt views=v.txt"
                + " output=out color=never" + (explains ? " front=p requested=t" : "");
    }
}

void ownRows()
{
    QTest::newRow("lint, its own options")
        << Arguments{"lint", "--each", "--fail-on", "note", "--ignore", "x", "f", "--ignore", "y"}
        << "command=lint files=f failOn=note ignore=x,y each=true";
    QTest::newRow("lint, fail on errors")
        << Arguments{"lint", "f", "--fail-on=error"} << "command=lint files=f failOn=error";
    QTest::newRow("lint, fail on warnings")
        << Arguments{"lint", "f", "--fail-on=warning"} << "command=lint files=f";
    QTest::newRow("explain, its own options")
        << Arguments{"explain", "f",      "p", "t",          "--domain",
                     "D",       "--view", "V", "--domain=E", "--view=W"}
        << "command=explain files=f front=p requested=t domain=D,E view=V,W";
    QTest::newRow("matrix, only some popups")
        << Arguments{"matrix", "f", "--only", "phone/*", "--only", "a/b"}
        << "command=matrix files=f only=phone/*,a/b";
    QTest::newRow("matrix, where popups are blocked")
        << Arguments{"matrix", "f", "--blocking", "--format", "csv"}
        << "command=matrix files=f format=csv blocking=true";
    QTest::newRow("schema, to a file")
        << Arguments{"schema", "--output", "s"} << "command=schema output=s";
    QTest::newRow("findings, to a file")
        << Arguments{"findings", "-o", "f.md"} << "command=findings output=f.md";
}

void choiceRows()
{
    const std::vector<std::tuple<Arguments, QString, QStringList>> commands = {
        {{"lint", "f"}, "command=lint files=f", {"json", "sarif"}},
        {{"explain", "f", "p", "t"}, "command=explain files=f", {"json"}},
        {{"matrix", "f"}, "command=matrix files=f", {"csv", "html"}},
        {{"diff", "f", "g"}, "command=diff files=f,g", {"json"}},
        {{"findings"}, "command=findings", {"markdown"}},
    };
    for (const auto &[start, text, formats] : commands) {
        const QString rest = start.front() == "explain" ? " front=p requested=t" : "";
        Arguments arguments = start;
        arguments.insert(arguments.end(), {"--format", "text"});
        QTest::addRow("%s as text", start.front().c_str()) << arguments << text + rest;
        for (const QString &format : formats) {
            arguments.back() = format.toStdString();
            QTest::addRow("%s as %s", start.front().c_str(), qPrintable(format))
                << arguments << text + " format=" + format + rest;
        }
    }
    QTest::newRow("colours always")
        << Arguments{"lint", "f", "--color=always"} << "command=lint files=f color=always";
    QTest::newRow("colours on a terminal")
        << Arguments{"lint", "f", "--color=auto"} << "command=lint files=f";
}

void unusualRows()
{
    QTest::newRow("options before and between") << Arguments{"lint", "--base", "b", "f", "--each"}
                                                << "command=lint files=f base=b each=true";
    QTest::newRow("an option takes one value")
        << Arguments{"lint", "--base", "b", "f", "g"} << "command=lint files=f,g base=b";
    QTest::newRow("a flag twice") << Arguments{"lint", "--each", "--each", "f"}
                                  << "command=lint files=f each=true";
    QTest::newRow("a value without a blank")
        << Arguments{"schema", "-os"} << "command=schema output=s";
    QTest::newRow("the standard input") << Arguments{"lint", "-"} << "command=lint files=-";
    QTest::newRow("the standard output")
        << Arguments{"lint", "-", "-o", "-"} << "command=lint files=-";
    QTest::newRow("files called as commands")
        << Arguments{"diff", "lint", "diff"} << "command=diff files=lint,diff";
    QTest::newRow("a file in brackets")
        << Arguments{"lint", "[a,b]", "[c]"} << "command=lint files=[a,b],[c]";
    QTest::newRow("a wildcard in brackets")
        << Arguments{"matrix", "f", "--only", "[a,b]"} << "command=matrix files=f only=[a,b]";
    QTest::newRow("a file of two plus signs")
        << Arguments{"lint", "++", "a"} << "command=lint files=++,a";
    QTest::newRow("a command behind --") << Arguments{"--", "lint", "a"} << "command=lint files=a";
    QTest::newRow("a file with a blank") << Arguments{"lint", "a b"} << "command=lint files=a b";
    QTest::newRow("a value with an equals sign")
        << Arguments{"lint", "f", "--base=a=b"} << "command=lint files=f base=a=b";
    QTest::newRow("files with a hyphen") << Arguments{"lint", "f", "--", "-b", "--each=", "--"}
                                         << "command=lint files=f,-b,--each=,--";
    QTest::newRow("popups with a hyphen") << Arguments{"explain", "f", "--", "-p", "--t"}
                                          << "command=explain files=f front=-p requested=--t";
    QTest::newRow("nothing behind --")
        << Arguments{"matrix", "f", "--"} << "command=matrix files=f";
}

} // namespace

void tst_CommandLine::argumentsBecomeOptions_data()
{
    QTest::addColumn<Arguments>("arguments");
    QTest::addColumn<QString>("options");
    commandRows();
    sharedRows();
    ownRows();
    choiceRows();
    unusualRows();
}

void tst_CommandLine::argumentsBecomeOptions()
{
    QFETCH(Arguments, arguments);
    QFETCH(QString, options);

    const Parsed parsed = parse(arguments);

    QCOMPARE(parsed.text, QByteArray());
    QCOMPARE(parsed.exitCode, 0);
    QVERIFY(parsed.options.has_value());
    QCOMPARE(optionText(*parsed.options), options);
}

void tst_CommandLine::aFileKeepsTheBytesOfItsName()
{
    const Parsed parsed = parse({"lint", "\xff\n", "--base", "\xfe"});

    QVERIFY(parsed.options.has_value());
    QCOMPARE(parsed.options->files, QList<QByteArray>({"\xff\n"}));
    QCOMPARE(parsed.options->base, QList<QByteArray>({"\xfe"}));
}

void tst_CommandLine::aNameIsReadAsUtf8()
{
    const Parsed parsed = parse({"explain", "f", "ger\xc3\xa4t/x", "y", "--view", "\xe2\x82\xac"});

    QVERIFY(parsed.options.has_value());
    QCOMPARE(parsed.options->front, QString::fromUtf16(u"ger\u00e4t/x"));
    QCOMPARE(parsed.options->views, QStringList({QString::fromUtf16(u"\u20ac")}));
}

QTEST_GUILESS_MAIN(tst_CommandLine)
#include "tst_commandline.moc"
