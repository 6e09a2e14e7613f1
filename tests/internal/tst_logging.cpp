#include "librarytest.h"

#include <HmiStateMachine/internal/logging.h>

#include <QThread>
#include <QtTest>

#include <memory>
#include <type_traits>
#include <vector>

namespace {

// Counts how often a piece of a message is asked for.
struct Piece
{
    QString text()
    {
        ++built;
        return QStringLiteral("piece");
    }

    int built = 0;
};

void write(QtMsgType level, Piece &piece)
{
    if (level == QtDebugMsg) {
        HMI_DEBUG(hmistatemachine()) << piece.text();
    } else {
        HMI_WARNING(hmistatemachine()) << piece.text();
    }
}

} // namespace

Q_DECLARE_METATYPE(QtMsgType)

class tst_Logging : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void theCategoryHasTheLibrarysName();
    void everyCallGivesTheSameObject();
    void everyThreadGetsTheSameObject();
    void filterRulesSetItsLevels();
    void aMessageCarriesItsPlaceInTheSource();
    void aHelperSpeaksInTheNameOfTheOperation();
    void nothingIsBuiltWhileTheLevelIsOff_data();
    void nothingIsBuiltWhileTheLevelIsOff();
    void aMessageIsBuiltOnceWhileTheLevelIsOn_data();
    void aMessageIsBuiltOnceWhileTheLevelIsOn();
    void aMessageIsOneStatement();
    void anotherCategoryHasLevelsOfItsOwn();
};

void tst_Logging::theCategoryHasTheLibrarysName()
{
    QCOMPARE(QByteArray(hmistatemachine().categoryName()), QByteArray("vosk.hmistatemachine"));
    QVERIFY((std::is_base_of<QLoggingCategory, HmiLoggingCategory>::value));
    QVERIFY((std::is_same<decltype(hmistatemachine()), HmiLoggingCategory &>::value));
}

void tst_Logging::everyCallGivesTheSameObject()
{
    QCOMPARE(&hmistatemachine(), &hmistatemachine());
}

void tst_Logging::everyThreadGetsTheSameObject()
{
    constexpr int count = 8;
    std::vector<const void *> seen(count, nullptr);
    std::vector<std::unique_ptr<QThread>> threads;
    for (int i = 0; i < count; ++i) {
        threads.emplace_back(QThread::create([&seen, i] { seen[i] = &hmistatemachine(); }));
    }

    for (const auto &thread : threads) {
        thread->start();
    }
    for (const auto &thread : threads) {
        QVERIFY(thread->wait());
    }

    QCOMPARE(seen, std::vector<const void *>(count, &hmistatemachine()));
}

void tst_Logging::filterRulesSetItsLevels()
{
    QVERIFY(!hmistatemachine().isDebugEnabled());
    QVERIFY(hmistatemachine().isWarningEnabled());

    messages().enableDebug();
    QVERIFY(hmistatemachine().isDebugEnabled());

    messages().disableWarnings();
    QVERIFY(!hmistatemachine().isWarningEnabled());
}

void tst_Logging::aMessageCarriesItsPlaceInTheSource()
{
    const int line = __LINE__ + 1;
    HMI_WARNING(hmistatemachine()) << "Here" << 1;

    const QList<Message> written = messages().takeMessages();
    QCOMPARE(written.size(), 1);
    QCOMPARE(written.first().toString(),
             QString("warning aMessageCarriesItsPlaceInTheSource: Here 1"));
    QCOMPARE(written.first().category, QString("vosk.hmistatemachine"));
    QVERIFY(written.first().file.endsWith("tst_logging.cpp"));
    QCOMPARE(written.first().line, line);
}

void tst_Logging::aHelperSpeaksInTheNameOfTheOperation()
{
    messages().enableDebug();

    HMI_DEBUG_FROM(hmistatemachine(), "operation") << "Done";
    HMI_WARNING_FROM(hmistatemachine(), "operation") << "Refused";

    QCOMPARE(messages().take(),
             QStringList({"debug operation: Done", "warning operation: Refused"}));
}

void tst_Logging::nothingIsBuiltWhileTheLevelIsOff_data()
{
    QTest::addColumn<QtMsgType>("level");

    QTest::newRow("debug") << QtDebugMsg;
    QTest::newRow("warning") << QtWarningMsg;
}

void tst_Logging::nothingIsBuiltWhileTheLevelIsOff()
{
    QFETCH(QtMsgType, level);
    messages().disableWarnings();
    Piece piece;

    write(level, piece);

    QCOMPARE(piece.built, 0);
    QCOMPARE(messages().take(), QStringList());
}

void tst_Logging::aMessageIsBuiltOnceWhileTheLevelIsOn_data()
{
    QTest::addColumn<QtMsgType>("level");
    QTest::addColumn<QString>("written");

    QTest::newRow("debug") << QtDebugMsg << "debug write: \"piece\"";
    QTest::newRow("warning") << QtWarningMsg << "warning write: \"piece\"";
}

void tst_Logging::aMessageIsBuiltOnceWhileTheLevelIsOn()
{
    QFETCH(QtMsgType, level);
    QFETCH(QString, written);
    messages().enableDebug();
    Piece piece;

    write(level, piece);

    QCOMPARE(piece.built, 1);
    QCOMPARE(messages().take(), QStringList({written}));
}

void tst_Logging::aMessageIsOneStatement()
{
    const bool refused = false;
    bool accepted = false;

    if (refused)
        HMI_WARNING(hmistatemachine()) << "Refused";
    else
        accepted = true;

    QVERIFY(accepted);
    QCOMPARE(messages().take(), QStringList());
}

void tst_Logging::anotherCategoryHasLevelsOfItsOwn()
{
    QLoggingCategory other("hmi.other");
    messages().enableDebug({"hmi.other"});

    HMI_DEBUG(other) << "Heard";
    HMI_DEBUG(hmistatemachine()) << "Unheard";

    const QList<Message> written = messages().takeMessages();
    QCOMPARE(written.size(), 1);
    QCOMPARE(written.first().category, QString("hmi.other"));
    QCOMPARE(written.first().text, QString("Heard"));
}

QTEST_GUILESS_MAIN(tst_Logging)
#include "tst_logging.moc"
