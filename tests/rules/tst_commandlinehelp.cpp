#include "commandline/commandline.h"

#include <QFile>
#include <QTest>

using namespace hmirules;
using Arguments = std::vector<std::string>;
Q_DECLARE_METATYPE(Arguments)

class tst_CommandLineHelp : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void helpIsAsExpected_data();
    void helpIsAsExpected();
    void helpFitsInATerminal_data();
    void helpFitsInATerminal();
    void helpPrecedesFaults_data();
    void helpPrecedesFaults();
    void theVersionIsPrinted_data();
    void theVersionIsPrinted();
};

namespace {

QByteArray expectedHelp(const QString &name)
{
    QFile file(QString(HMI_TEST_DATA_DIR "/%1.expected").arg(name));
    return file.open(QFile::ReadOnly) ? file.readAll() : QByteArray("no such file");
}

void commandRows()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<Arguments>("arguments");
    QTest::newRow("program") << "hmi-rules" << Arguments{"--help"};
    for (const char *command : {"lint", "explain", "matrix", "diff", "schema", "findings"}) {
        QTest::newRow(command) << command << Arguments{command, "--help"};
    }
}

} // namespace

void tst_CommandLineHelp::helpIsAsExpected_data()
{
    commandRows();
    QTest::newRow("program, by letter") << "hmi-rules" << Arguments{"-h"};
    QTest::newRow("command, by letter") << "diff" << Arguments{"diff", "-h"};
    QTest::newRow("before the command") << "diff" << Arguments{"--help", "diff"};
}

void tst_CommandLineHelp::helpIsAsExpected()
{
    QFETCH(QString, name);
    QFETCH(Arguments, arguments);

    const Parsed parsed = parse(arguments);

    QVERIFY(!parsed.options.has_value());
    QCOMPARE(parsed.exitCode, 0);
    QCOMPARE(QString::fromUtf8(parsed.text).split('\n'),
             QString::fromUtf8(expectedHelp(name)).split('\n'));
}

void tst_CommandLineHelp::helpFitsInATerminal_data()
{
    commandRows();
}

void tst_CommandLineHelp::helpFitsInATerminal()
{
    QFETCH(Arguments, arguments);

    for (const QByteArray &line : parse(arguments).text.split('\n')) {
        QVERIFY2(line.size() <= 80, line);
        QVERIFY2(!line.endsWith(' '), line);
    }
}

void tst_CommandLineHelp::helpPrecedesFaults_data()
{
    QTest::addColumn<Arguments>("arguments");
    QTest::newRow("nothing else") << Arguments{"lint", "--help"};
    QTest::newRow("unknown option") << Arguments{"lint", "--bogus", "--help"};
    QTest::newRow("wrong value") << Arguments{"lint", "f", "--format", "x", "--help"};
    QTest::newRow("value missing") << Arguments{"lint", "--help", "--base"};
    QTest::newRow("version too") << Arguments{"lint", "--version", "--help"};
}

void tst_CommandLineHelp::helpPrecedesFaults()
{
    QFETCH(Arguments, arguments);

    const Parsed parsed = parse(arguments);

    QCOMPARE(parsed.exitCode, 0);
    QCOMPARE(parsed.text.split('\n').first(),
             QByteArray("Usage: hmi-rules lint [OPTION...] FILE..."));
}

void tst_CommandLineHelp::theVersionIsPrinted_data()
{
    QTest::addColumn<Arguments>("arguments");
    QTest::newRow("program") << Arguments{"--version"};
    for (const char *command : {"lint", "explain", "matrix", "diff", "schema", "findings"}) {
        QTest::newRow(command) << Arguments{command, "--version"};
    }
}

void tst_CommandLineHelp::theVersionIsPrinted()
{
    QFETCH(Arguments, arguments);

    const Parsed parsed = parse(arguments);

    QVERIFY(!parsed.options.has_value());
    QCOMPARE(parsed.exitCode, 0);
    QCOMPARE(parsed.text, QByteArray("hmi-rules " HMI_PROJECT_VERSION "\n"));
}

QTEST_GUILESS_MAIN(tst_CommandLineHelp)
#include "tst_commandlinehelp.moc"
