// The examples of the headers of the view layer: C++ is included, QML is made into a scene.

#include "driving.h"
#include "librarytest.h"
#include "scene.h"

#include <HmiStateMachineQuick/quickviewstatetarget.h>
#include <HmiStateMachineQuick/screenhost.h>

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QDir>
#include <QFile>
#include <QQmlApplicationEngine>
#include <QRegularExpression>
#include <QtTest>

using namespace HmiStateMachine;

class tst_QuickHeaderExamples : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void anApplicationHasASceneForItsFlow();
    void eachPieceOfQmlMakesAScene_data();
    void eachPieceOfQmlMakesAScene();
};

void tst_QuickHeaderExamples::anApplicationHasASceneForItsFlow()
{
    QScopedPointer<HmiViewState> home;
    const auto buildFlow = [&home](StateMachine *machine) {
        home.reset(new HmiViewState("Home", machine));
        machine->setInitialState(home.data());
    };
#include "quickviewstatetarget.inc"

    settle();

    QCOMPARE(engine.rootObjects().size(), 1);
    const auto *host = engine.rootObjects().first()->findChild<ScreenHost *>();
    QVERIFY(host);
    QVERIFY(host->currentItem());
    QCOMPARE(host->currentItem()->objectName(), "home screen");
    park(*StateMachine::instance());
}

void tst_QuickHeaderExamples::eachPieceOfQmlMakesAScene_data()
{
    QTest::addColumn<QByteArray>("qml");

    static const QRegularExpression example("@code\\{\\.qml\\}\n(.*?)@endcode",
                                            QRegularExpression::DotMatchesEverythingOption);
    const QDir folder(HMI_QUICK_HEADERS_DIR);
    const auto headers = folder.entryList({"*.h"});
    int found = 0;
    for (const QString &header : headers) {
        QFile file(folder.filePath(header));
        QVERIFY(file.open(QIODevice::ReadOnly));
        const auto match = example.match(QString::fromUtf8(file.readAll()));
        if (match.hasMatch()) {
            const QString text = match.captured(1).replace(QRegularExpression("(^|\n) \\*"), "\\1");
            QTest::newRow(qPrintable(header)) << text.toUtf8();
            ++found;
        }
    }
    QVERIFY(found > 3);
}

void tst_QuickHeaderExamples::eachPieceOfQmlMakesAScene()
{
    QFETCH(QByteArray, qml);
    QuickViewStateTarget target;
    Files files;
    QVERIFY(files.write("HomeScreen.qml", "import QtQuick 2.15\nItem { }"));
    QVERIFY(files.write("WarningPopup.qml", "import QtQuick 2.15\nItem { }"));

    Scene scene("Item {\n" + qml + "}", files.url("Scene.qml"));

    QVERIFY(scene.root());
    QCOMPARE(scene.takeWarnings(), QStringList());
}

QTEST_MAIN(tst_QuickHeaderExamples)
#include "tst_quickheaderexamples.moc"
