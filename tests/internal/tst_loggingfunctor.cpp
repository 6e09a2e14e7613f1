#include "driving.h"
#include "emitter.h"
#include "librarytest.h"

#include <HmiStateMachine/internal/loggingfunctor.h>
#include <HmiStateMachine/named/namedstate.h>

#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

class tst_LoggingFunctor : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void eachCallWritesTheTextOnce();
    void theMessageIsOfTheLibrarysCategory();
    void theTextIsWrittenAsAString_data();
    void theTextIsWrittenAsAString();
    void nothingIsWrittenWhileDebugOutputIsOff();
    void theLevelIsAskedAtEachCall();
    void aCopyWritesTheSameText();
    void anAssignedFunctorWritesTheNewText();
    void aConnectedFunctorLogsTheEmission();
    void theEntryOfAStateCanBeLogged();
};

void tst_LoggingFunctor::eachCallWritesTheTextOnce()
{
    messages().enableDebug();
    const LoggingFunctor log("Condition was met");

    log();
    log();

    QCOMPARE(messages().take(),
             QStringList({"debug operator(): \"Condition was met\"",
                          "debug operator(): \"Condition was met\""}));
}

void tst_LoggingFunctor::theMessageIsOfTheLibrarysCategory()
{
    messages().enableDebug();

    LoggingFunctor("Here")();

    const QList<Message> written = messages().takeMessages();
    QCOMPARE(written.size(), 1);
    QCOMPARE(written.first().category, QString("vosk.hmistatemachine"));
    QCOMPARE(written.first().type, QtDebugMsg);
    QVERIFY(written.first().file.endsWith("loggingfunctor.cpp"));
    QVERIFY(written.first().line > 0);
}

void tst_LoggingFunctor::theTextIsWrittenAsAString_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("written");

    QTest::newRow("nothing") << ""
                             << R"("")";
    QTest::newRow("words") << "one two"
                           << R"("one two")";
    QTest::newRow("quotes") << R"(a "b")"
                            << R"("a \"b\"")";
    QTest::newRow("place markers") << "%1 %s"
                                   << R"("%1 %s")";
}

void tst_LoggingFunctor::theTextIsWrittenAsAString()
{
    QFETCH(QString, text);
    messages().enableDebug();

    LoggingFunctor{text}();

    const QList<Message> written = messages().takeMessages();
    QCOMPARE(written.size(), 1);
    QTEST(written.first().text, "written");
}

void tst_LoggingFunctor::nothingIsWrittenWhileDebugOutputIsOff()
{
    LoggingFunctor("Unheard")();

    QCOMPARE(messages().take(), QStringList());
}

void tst_LoggingFunctor::theLevelIsAskedAtEachCall()
{
    const LoggingFunctor log("Heard from now on");
    log();
    messages().enableDebug();

    log();

    QCOMPARE(messages().take(), QStringList({"debug operator(): \"Heard from now on\""}));
}

void tst_LoggingFunctor::aCopyWritesTheSameText()
{
    messages().enableDebug();
    QScopedPointer<LoggingFunctor> original(new LoggingFunctor("Kept"));
    const LoggingFunctor copy = *original;
    original.reset();

    copy();

    QCOMPARE(messages().take(), QStringList({"debug operator(): \"Kept\""}));
}

void tst_LoggingFunctor::anAssignedFunctorWritesTheNewText()
{
    messages().enableDebug();
    LoggingFunctor log("Before");
    log = LoggingFunctor("After");

    log();

    QCOMPARE(messages().take(), QStringList({"debug operator(): \"After\""}));
}

void tst_LoggingFunctor::aConnectedFunctorLogsTheEmission()
{
    messages().enableDebug();
    Emitter emitter;
    connect(&emitter, &Emitter::plain, LoggingFunctor("Plain"));
    connect(&emitter, &Emitter::withInt, LoggingFunctor("Number"));

    Q_EMIT emitter.withInt(1);
    Q_EMIT emitter.plain();
    Q_EMIT emitter.other();

    QCOMPARE(messages().take(),
             QStringList({"debug operator(): \"Number\"", "debug operator(): \"Plain\""}));
}

void tst_LoggingFunctor::theEntryOfAStateCanBeLogged()
{
    QStateMachine machine;
    auto *state = new NamedState("Logged", &machine);
    connect(state, &QAbstractState::entered, LoggingFunctor("Logged is entered"));
    messages().enableDebug();

    startIn(machine, state);

    QCOMPARE(messages().take(), QStringList({"debug operator(): \"Logged is entered\""}));
}

QTEST_GUILESS_MAIN(tst_LoggingFunctor)
#include "tst_loggingfunctor.moc"
