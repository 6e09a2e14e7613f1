#include "commandline/commandline.h"

#include <QTest>

using namespace hmirules;
using Arguments = std::vector<std::string>;
Q_DECLARE_METATYPE(Arguments)

class tst_CommandLineErrors : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void aWrongCommandIsRefused_data();
    void aWrongCommandIsRefused();
    void anOptionBeforeTheCommandIsRefused_data();
    void anOptionBeforeTheCommandIsRefused();
    void aWrongParameterIsRefused_data();
    void aWrongParameterIsRefused();
};

namespace {

void columns()
{
    QTest::addColumn<Arguments>("arguments");
    QTest::addColumn<QByteArray>("error");
}

void row(const char *tag, const Arguments &arguments, const char *error)
{
    QTest::newRow(tag) << arguments << QByteArray(error);
}

void optionRows()
{
    row("unknown option", {"lint", "--colour", "f"},
        R"(unknown option "--colour"; did you mean "--color"?)");
    row("unknown option with a value", {"lint", "--fromat=json", "f"},
        R"(unknown option "--fromat"; did you mean "--format"?)");
    row("two letters mistaken", {"lint", "--calar", "f"},
        R"(unknown option "--calar"; did you mean "--color"?)");
    row("unknown option like no other", {"lint", "--quieter-than-usual", "f"},
        R"(unknown option "--quieter-than-usual")");
    row("unknown letter", {"lint", "-x", "f"}, R"(unknown option "-x")");
    row("option of another command", {"diff", "--each", "a", "b"}, R"(unknown option "--each")");
    row("value missing", {"lint", "f", "--base"}, R"(option "--base" needs a value: FILE)");
    row("value of a choice missing", {"lint", "f", "--fail-on"},
        R"(option "--fail-on" needs a value: note|warning|error)");
    row("value of a letter missing", {"lint", "f", "-o"}, R"(option "-o" needs a value: FILE)");
    row("value empty behind =", {"lint", "--output=", "f"}, R"(option "--output=" needs a value)");
    row("value empty", {"lint", "f", "--inventory", ""}, "option --inventory is empty");
    row("flag with a value", {"lint", "f", "--each=no"}, "option --each takes no value");
    row("option given twice", {"lint", "f", "-o", "a", "--output", "b"},
        "option --output is given 2 times; it may be given once");
    row("name not in UTF-8", {"matrix", "f", "--only", "\xff"}, "option --only is not valid UTF-8");
    row("id not in UTF-8", {"lint", "f", "--ignore", "\xff"}, "option --ignore is not valid UTF-8");
    row("control characters", {"lint", "--\x1b[31m\x7f", "f"},
        R"(unknown option "--\x1b[31m\x7f")");
}

void choiceRows()
{
    row("format of lint", {"lint", "f", "--format", "csv"},
        R"("csv" is no value of --format, which takes text, json or sarif)");
    row("format of explain", {"explain", "f", "p", "t", "--format", "sarif"},
        R"("sarif" is no value of --format, which takes text or json)");
    row("format of matrix", {"matrix", "f", "--format", "JSON"},
        R"("JSON" is no value of --format, which takes text, csv or html)");
    row("format of diff", {"diff", "f", "g", "--format", "csv"},
        R"("csv" is no value of --format, which takes text or json)");
    row("format of findings", {"findings", "--format", "html"},
        R"("html" is no value of --format, which takes text or markdown)");
    row("severity", {"lint", "f", "--fail-on", "fatal"},
        R"("fatal" is no value of --fail-on, which takes note, warning or error)");
    row("colours", {"lint", "f", "--color", "yes"},
        R"("yes" is no value of --color, which takes auto, always or never)");
}

void argumentRows()
{
    row("no file", {"lint"}, "argument FILE is missing");
    row("no file behind --", {"lint", "--"}, "argument FILE is missing");
    row("no target", {"explain", "f", "p"}, "argument TARGET is missing");
    row("no popup", {"explain", "f"}, "argument POPUP is missing");
    row("no file of the matrix", {"matrix", "--blocking"}, "argument FILE is missing");
    row("no new file", {"diff", "a"}, "argument NEW is missing");
    row("a file too many", {"diff", "a", "b", "c"}, R"(unexpected argument "c")");
    row("a popup too many", {"explain", "f", "p", "t", "u"}, R"(unexpected argument "u")");
    row("an argument of schema", {"schema", "f"}, R"(unexpected argument "f")");
    row("two findings", {"findings", "a", "b"}, R"(unexpected argument "b")");
    row("file empty", {"lint", "a", ""}, "argument FILE is empty");
    row("popup empty", {"explain", "f", "", "t"}, "argument POPUP is empty");
    row("popup not in UTF-8", {"explain", "f", "p", "\xff"}, "argument TARGET is not valid UTF-8");
}

void contradictionRows()
{
    row("blocking as text", {"matrix", "f", "--blocking"}, "option --blocking needs --format csv");
    row("blocking as a page", {"matrix", "f", "--blocking", "--format", "html"},
        "option --blocking needs --format csv");
    row("standard input twice", {"diff", "-", "-"},
        R"(the standard input, "-", is named 2 times; it can be read once)");
    row("standard input as list and file", {"lint", "-", "--popups", "-", "--base", "-"},
        R"(the standard input, "-", is named 3 times; it can be read once)");
    row("standard input as inventory and list",
        {"matrix", "f", "--inventory", "-", "--domains", "-"},
        R"(the standard input, "-", is named 2 times; it can be read once)");
    row("standard input as base and list", {"matrix", "f", "--base", "-", "--views", "-"},
        R"(the standard input, "-", is named 2 times; it can be read once)");
    row("output over a file", {"lint", "a", "b", "-o", "b"},
        R"(the output "b" would overwrite an input)");
    row("output over a list", {"lint", "a", "--views", "v/w", "-o", "./v//w"},
        R"(the output "./v//w" would overwrite an input)");
}

void checkRefused(const QByteArray &error, const QByteArray &help)
{
    QFETCH(Arguments, arguments);

    const Parsed parsed = parse(arguments);

    QVERIFY(!parsed.options.has_value());
    QCOMPARE(parsed.text, "hmi-rules: " + error + "\nTry \"" + help + "\".\n");
    QCOMPARE(parsed.exitCode, 2);
}

} // namespace

void tst_CommandLineErrors::aWrongCommandIsRefused_data()
{
    columns();
    row("none", {},
        "a command is missing; the commands are lint, explain, matrix, diff, schema and findings");
    row("mistyped", {"lnit", "f"}, R"(unknown command "lnit"; did you mean "lint"?)");
    row("mistyped, with a wish for help", {"maxtrix", "--help"},
        R"(unknown command "maxtrix"; did you mean "matrix"?)");
    row("mistyped, behind a wish for help", {"--help", "maxtrix"},
        R"(unknown command "maxtrix"; did you mean "matrix"?)");
    row("like no other", {"convert"},
        R"(unknown command "convert"; the commands are lint, explain, matrix, diff, schema and findings)");
    row("empty", {""},
        R"(unknown command ""; the commands are lint, explain, matrix, diff, schema and findings)");
    row("a long one", {std::string(65, 'x')},
        (R"(unknown command ")" + std::string(65, 'x')
         + R"("; the commands are lint, explain, matrix, diff, schema and findings)")
            .c_str());
    row("an option alone", {"--versoin"},
        R"(unknown option "--versoin"; did you mean "--version"?)");
    row("before another", {"foo", "lint", "f"},
        R"(unknown command "foo"; the commands are lint, explain, matrix, diff, schema and findings)");
    row("an option of a command alone", {"--each"}, R"(option "--each" belongs behind a command)");
}

void tst_CommandLineErrors::anOptionBeforeTheCommandIsRefused_data()
{
    columns();
    row("flag", {"--each", "lint", "f"}, R"(option "--each" belongs behind a command)");
    row("option", {"--base", "a", "lint", "f"}, R"(option "--base" belongs behind a command)");
    row("letter", {"-o", "lint", "f"}, R"(option "-o" belongs behind a command)");
    row("with a value", {"--format=json", "lint", "f"},
        R"(option "--format=json" belongs behind a command)");
    row("unknown", {"--versions", "lint", "f"},
        R"(unknown option "--versions"; did you mean "--version"?)");
}

void tst_CommandLineErrors::anOptionBeforeTheCommandIsRefused()
{
    QFETCH(Arguments, arguments);
    QFETCH(QByteArray, error);
    const bool named = arguments.at(1) == "lint";

    checkRefused(error, named ? "hmi-rules lint --help" : "hmi-rules --help");
}

void tst_CommandLineErrors::aWrongCommandIsRefused()
{
    QFETCH(QByteArray, error);

    checkRefused(error, "hmi-rules --help");
}

void tst_CommandLineErrors::aWrongParameterIsRefused_data()
{
    columns();
    optionRows();
    choiceRows();
    argumentRows();
    contradictionRows();
    row("the first of several faults", {"lint", "--bogus", "--format", "x"},
        R"(unknown option "--bogus")");
}

void tst_CommandLineErrors::aWrongParameterIsRefused()
{
    QFETCH(Arguments, arguments);
    QFETCH(QByteArray, error);

    const QByteArray command = QByteArray::fromStdString(arguments.front());

    checkRefused(error, "hmi-rules " + command + " --help");
}

QTEST_GUILESS_MAIN(tst_CommandLineErrors)
#include "tst_commandlineerrors.moc"
