#include "docgen/manpage.h"
#include "docgen/roff.h"

#include <QFile>
#include <QProcess>
#include <QRegularExpression>
#include <QTest>

using namespace hmirules;

class tst_ManPage : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void thePageIsTypesetWithoutAWarning();
    void thePageHasItsSectionsInOrder();
    void thePageShowsEachCommandWithItsUsage();
    void thePageShowsOptions_data();
    void thePageShowsOptions();
    void thePageBearsNoDate();
    void textIsTypesetLetterByLetter_data();
    void textIsTypesetLetterByLetter();
    void hyphensStayCopyable();
};

namespace {

struct Typeset
{
    QString text;
    QString warnings;
};

// With all warnings, and without overstriking for bold and underlined letters.
Typeset typeset(const QByteArray &page)
{
    QProcess groff;
    groff.start(HMI_TEST_GROFF,
                {"-man", "-Tascii", "-ww", "-P-c", "-P-b", "-P-o", "-P-u", "-rLL=78n"});
    groff.write(page);
    groff.closeWriteChannel();
    if (!groff.waitForFinished() || groff.exitCode() != 0) {
        return {QString(), "groff failed: " + groff.errorString() + groff.readAllStandardError()};
    }
    return {groff.readAllStandardOutput(), groff.readAllStandardError()};
}

QByteArray builtPage()
{
    QFile file(HMI_MAN_PAGE);
    return file.open(QFile::ReadOnly) ? file.readAll() : QByteArray();
}

QStringList matches(const QString &text, const QString &pattern)
{
    const QRegularExpression expression(pattern, QRegularExpression::MultilineOption);
    QStringList found;
    for (auto each = expression.globalMatch(text); each.hasNext();) {
        found.append(each.next().captured(1));
    }
    return found;
}

} // namespace

void tst_ManPage::thePageIsTypesetWithoutAWarning()
{
    const Typeset page = typeset(builtPage());

    QCOMPARE(page.warnings, QString());
    QVERIFY(!page.text.isEmpty());
}

void tst_ManPage::thePageHasItsSectionsInOrder()
{
    QCOMPARE(matches(typeset(builtPage()).text, "^([A-Z ]*[A-Z])$"),
             QStringList({"NAME", "SYNOPSIS", "DESCRIPTION", "COMMANDS", "EXIT STATUS", "EXAMPLES",
                          "FILES", "SEE ALSO"}));
}

void tst_ManPage::thePageShowsEachCommandWithItsUsage()
{
    const QStringList usages = matches(typeset(builtPage()).text, "^   [a-z]+\n +(hmi-rules .*)$");

    QCOMPARE(usages,
             QStringList({"hmi-rules lint [OPTION...] FILE...",
                          "hmi-rules explain [OPTION...] FILE POPUP TARGET",
                          "hmi-rules matrix [OPTION...] FILE", "hmi-rules diff [OPTION...] OLD NEW",
                          "hmi-rules schema [OPTION...]", "hmi-rules findings [OPTION...] [ID]"}));
}

void tst_ManPage::thePageShowsOptions_data()
{
    QTest::addColumn<QString>("heading");
    QTest::addColumn<int>("commands");
    QTest::newRow("flag") << "--blocking" << 1;
    QTest::newRow("file") << "--base FILE" << 4;
    QTest::newRow("choice") << "--fail-on note|warning|error" << 1;
    QTest::newRow("with a letter") << "-o, --output FILE" << 6;
    QTest::newRow("help") << "-h, --help" << 6;
}

void tst_ManPage::thePageShowsOptions()
{
    QFETCH(QString, heading);
    QFETCH(int, commands);

    const QString pattern = "^ {7}(" + QRegularExpression::escape(heading) + ")(?:$|  )";

    QCOMPARE(matches(typeset(builtPage()).text, pattern).size(), commands);
}

void tst_ManPage::thePageBearsNoDate()
{
    QCOMPARE(builtPage().split('\n').first(),
             QByteArray(R"(.TH HMI\-RULES 1 "" "HmiStateMachine )" HMI_PROJECT_VERSION
                        R"(" "User Commands")"));
    QCOMPARE(builtPage(), manPage(program()));
}

void tst_ManPage::textIsTypesetLetterByLetter_data()
{
    QTest::addColumn<QByteArray>("text");
    for (const char *text :
         {"plain", ".TH is no request here", "'br is none either", R"(a \fBbackslash\fR \n(.x)",
          R"("quoted")", "'*' `b` ~ ^ | {}", "--option -o", "1.5 a.b ...", "C# % @ $(x)"}) {
        QTest::newRow(text) << QByteArray(text);
    }
}

void tst_ManPage::textIsTypesetLetterByLetter()
{
    QFETCH(QByteArray, text);

    for (const QByteArray &line : {roff(text), bold(text), italic(text)}) {
        const Typeset page = typeset(".TH A 1 \"\" B C\n.SH D\n" + line + '\n');

        QCOMPARE(page.warnings, QString());
        QCOMPARE(matches(page.text, "^D\n {7}(.*)$"), QStringList({text}));
    }
}

// Typeset for ASCII, where a hyphen and a minus look alike, this shows in the source alone.
void tst_ManPage::hyphensStayCopyable()
{
    QCOMPARE(roff("--fail-on"), QByteArray(R"(\-\-fail\-on)"));
    QVERIFY(!QString(builtPage()).contains(QRegularExpression(R"((?<!\\)-)")));
    QCOMPARE(roff("'~^`\""), QByteArray(R"(\(aq\(ti\(ha\(ga\(dq)"));
}

QTEST_GUILESS_MAIN(tst_ManPage)
#include "tst_manpage.moc"
