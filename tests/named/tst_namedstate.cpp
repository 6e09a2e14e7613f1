#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"

#include <HmiStateMachine/named/namedstate.h>

#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

class tst_NamedState : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void theSecondStateOfANameIsLeftWithoutOne();
    void aPathBeginsAtTheMachine();
};

void tst_NamedState::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(NamedState::staticMetaObject),
             QStringList({"signal nameChanged(Identifier name)", "slot setName(Identifier name)",
                          "property Identifier name read write nameChanged(Identifier)"}));
}

void tst_NamedState::theSecondStateOfANameIsLeftWithoutOne()
{
    NamedState first("Radio");
    NamedState second("Radio");

    QCOMPARE(second.name(), QString());
    QCOMPARE(NamedState::stateForName("Radio"), &first);
    const QList<Message> warnings = messages().takeMessages();
    QCOMPARE(warnings.size(), 1);
    QCOMPARE(warnings.first().function, QString("hash"));
    QVERIFY(warnings.first().text.startsWith("NamedState name collision detected!\n"));
}

void tst_NamedState::aPathBeginsAtTheMachine()
{
    QStateMachine machine;
    auto *a = new NamedState("A", &machine);
    auto *b = new NamedState("B", a);
    auto *c = new NamedState("C", b);
    a->setInitialState(b);
    b->setInitialState(c);
    NamedState::setLoggingEnabled(true);
    messages().enableDebug();

    startIn(machine, a);

    QCOMPARE(messages().take(),
             QStringList({"debug onEntry: Entering state: \"Unnamed->A\"",
                          "debug onEntry: Entering state: \"Unnamed->A->B\"",
                          "debug onEntry: Entering state: \"Unnamed->A->B->C\""}));
}

QTEST_GUILESS_MAIN(tst_NamedState)
#include "tst_namedstate.moc"
