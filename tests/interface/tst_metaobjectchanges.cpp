#include "changes.h"

#include <QtTest>

Q_DECLARE_METATYPE(VersionStep)

namespace {

const char *const interface = "class Host: QObject\n"
                              "    info DefaultProperty: data\n"
                              "    signal void shown(QString id, int kind)\n"
                              "    signal void hidden(QString id)\n"
                              "    slot void show(QString id)\n"
                              "    property kind: int, read, notify kindChanged()\n"
                              "    enum Effect: values\n"
                              "    value Effect::Cut = 0\n"
                              "    value Effect::Fade = 1\n"
                              "class View: Host\n";

} // namespace

class tst_MetaObjectChanges : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void aChangeNamesItsClassAndItsStep_data();
    void aChangeNamesItsClassAndItsStep();
    void whatIsTheSameHasNoChanges();
    void theHighestOfSeveralStepsCounts();
    void anOverloadIsAddedBesideWhatItOverloads();
};

void tst_MetaObjectChanges::aChangeNamesItsClassAndItsStep_data()
{
    QTest::addColumn<QString>("from");
    QTest::addColumn<QString>("to");
    QTest::addColumn<VersionStep>("step");
    QTest::addColumn<QString>("line");
    const auto row = [](const char *tag, const char *from, const char *to, VersionStep step,
                        const char *line) { QTest::newRow(tag) << from << to << step << line; };

    row("signal added", "    slot", "    signal void left()\n    slot", VersionStep::Minor,
        "Host: added (minor): signal void left()");
    row("signal removed", "    signal void hidden(QString id)\n", "", VersionStep::Major,
        "Host: removed (major): signal void hidden(QString id)");
    row("signal's parameter renamed", "hidden(QString id)", "hidden(QString name)",
        VersionStep::Major,
        "Host: changed (major): signal void hidden(QString id) -> signal void hidden(QString "
        "name)");
    row("signal moved",
        "    signal void shown(QString id, int kind)\n    signal void hidden(QString id)\n",
        "    signal void hidden(QString id)\n    signal void shown(QString id, int kind)\n",
        VersionStep::Major,
        "Host: reordered (major): signal void hidden(QString id) now comes before "
        "signal void shown(QString id, int kind)");
    row("slot becomes private", "    slot", "    private slot", VersionStep::Major,
        "Host: changed (major): slot void show(QString id) -> private slot void show(QString id)");
    row("slot becomes a method", "    slot", "    method", VersionStep::Major,
        "Host: changed (major): slot void show(QString id) -> method void show(QString id)");
    row("property read-only no more", "read, notify", "read, write, notify", VersionStep::Major,
        "Host: changed (major): property kind: int, read, notify kindChanged() -> "
        "property kind: int, read, write, notify kindChanged()");
    row("property renamed", "kind: int", "sort: int", VersionStep::Major,
        "Host: removed (major): property kind: int, read, notify kindChanged()");
    row("enumerator added", "Fade = 1\n", "Fade = 1\n    value Effect::Slide = 2\n",
        VersionStep::Minor, "Host: added (minor): value Effect::Slide = 2");
    row("enumerator's value changed", "Fade = 1", "Fade = 4", VersionStep::Major,
        "Host: changed (major): value Effect::Fade = 1 -> value Effect::Fade = 4");
    row("enum becomes flags", "Effect: values", "Effect: flags", VersionStep::Major,
        "Host: changed (major): enum Effect: values -> enum Effect: flags");
    row("class info changed", "Property: data", "Property: items", VersionStep::Major,
        "Host: changed (major): info DefaultProperty: data -> info DefaultProperty: items");
    row("class added", "class View", "class Item: QObject\nclass View", VersionStep::Minor,
        "Item: added (minor): the class");
    row("class removed", "class View: Host\n", "", VersionStep::Major,
        "View: removed (major): the class");
    row("superclass changed", "View: Host", "View: QObject", VersionStep::Major,
        "View: changed (major): superclass Host -> QObject");
}

void tst_MetaObjectChanges::aChangeNamesItsClassAndItsStep()
{
    QFETCH(QString, from);
    QFETCH(QString, to);
    QFETCH(VersionStep, step);
    QFETCH(QString, line);
    const QString after = QString(interface).replace(from, to);

    const InterfaceChanges changes = interfaceChanges(interface, after);

    QCOMPARE(changes.lines.value(0), line);
    QCOMPARE(changes.step, step);
}

void tst_MetaObjectChanges::whatIsTheSameHasNoChanges()
{
    const InterfaceChanges changes = interfaceChanges(interface, interface);

    QCOMPARE(changes.lines, QStringList());
    QCOMPARE(changes.step, VersionStep::None);
}

void tst_MetaObjectChanges::theHighestOfSeveralStepsCounts()
{
    const QString after = QString(interface).replace("class View: Host\n",
                                                     "class View: QObject\n    slot void go()\n");

    const InterfaceChanges changes = interfaceChanges(interface, after);

    QCOMPARE(changes.lines,
             QStringList({"View: changed (major): superclass Host -> QObject",
                          "View: added (minor): slot void go()"}));
    QCOMPARE(changes.step, VersionStep::Major);
}

void tst_MetaObjectChanges::anOverloadIsAddedBesideWhatItOverloads()
{
    const QString after =
        QString(interface).replace("    property", "    slot void show(int number)\n    property");

    const InterfaceChanges changes = interfaceChanges(interface, after);

    QCOMPARE(changes.lines, QStringList("Host: added (minor): slot void show(int number)"));
    QCOMPARE(changes.step, VersionStep::Minor);
}

QTEST_GUILESS_MAIN(tst_MetaObjectChanges)
#include "tst_metaobjectchanges.moc"
