#include "driving.h"
#include "flow.h"
#include "librarytest.h"

#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupstate.h>
#include <HmiStateMachineQuick/popuphost.h>
#include <HmiStateMachineQuick/quickviewstatetarget.h>
#include <HmiStateMachineQuick/screenhost.h>

#include <QQmlApplicationEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTimer>
#include <QtTest>

#include <algorithm>
#include <memory>

using namespace HmiStateMachine;

namespace {

QStringList s_console;

void keepMessage(QtMsgType, const QMessageLogContext &, const QString &text)
{
    s_console.append(text);
}

QString titleIn(const QQuickItem *item)
{
    const auto *title = item->findChild<QObject *>("title");
    return title ? title->property("text").toString() : QString();
}

// The one with that text that can be seen; a title has none of its own.
QQuickItem *buttonIn(QQuickItem *item, const QString &text)
{
    if (!item->isVisible()) {
        return nullptr;
    }
    if (item->metaObject()->indexOfSignal("clicked()") >= 0 && item->property("text") == text) {
        return item;
    }
    const auto children = item->childItems();
    for (QQuickItem *child : children) {
        if (QQuickItem *button = buttonIn(child, text)) {
            return button;
        }
    }
    return nullptr;
}

// The whole program but for main(), whose hosts move nothing unless they are told to.
class Application
{
public:
    Application()
    {
        buildFlow();
        engine.load(QUrl("qrc:/Main.qml"));
        window = qobject_cast<QQuickWindow *>(engine.rootObjects().value(0));
        screens = window->findChild<ScreenHost *>();
        popups = window->findChild<PopupHost *>();
        setDuration(0);
        StateMachine::instance()->start();
        settle();
        QTRY_VERIFY(window->isExposed()); // before that the scene has no size
    }

    ~Application()
    {
        park(*StateMachine::instance());
        delete NamedState::stateForName("Layers");
    }

    void setDuration(int ms)
    {
        screens->setProperty("duration", ms);
        popups->setProperty("duration", ms);
    }

    // Also what has no effect may be pressed: what lies above takes it.
    void press(const QPointF &place)
    {
        QTest::mouseClick(window, Qt::LeftButton, Qt::NoModifier, place.toPoint());
        settle();
    }

    QPointF placeOf(const QString &text) const
    {
        const QQuickItem *button = buttonIn(window->contentItem(), text);
        return button ? button->mapToScene(button->boundingRect().center()) : QPointF(-1, -1);
    }

    void press(const QString &text) { press(placeOf(text)); }

    QStringList visibleScreens() const { return titles(screens); }

    QStringList visiblePopups() const { return titles(popups); } // the lowest first

    QuickViewStateTarget viewLayer;
    QQmlApplicationEngine engine;
    QQuickWindow *window;
    ScreenHost *screens;
    PopupHost *popups;

private:
    static QStringList titles(const QQuickItem *host)
    {
        auto items = host->childItems();
        std::stable_sort(items.begin(), items.end(),
                         [](QQuickItem *a, QQuickItem *b) { return a->z() < b->z(); });
        QStringList result;
        for (const QQuickItem *item : qAsConst(items)) {
            if (item->isVisible() && item->opacity() > 0) {
                result.append(titleIn(item));
            }
        }
        return result;
    }
};

} // namespace

class tst_QuickStart : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void theHomeScreenComesFirstAndLeadsNowhereBack();
    void eachButtonLeadsOnAndBackLeadsBack();
    void aStationIsShownByTheDataOfTheRequest_data();
    void aStationIsShownByTheDataOfTheRequest();
    void theVolumeLiesOverTheQuestionAndGoesByItself();
    void eachPressChangesTheVolume();
    void theQuestionIsAnswered_data();
    void theQuestionIsAnswered();
    void theQuestionKeepsTheScreenFromBeingPressed();
    void screensMoveForwardsAndBack();
    void cleanupTestCase();

private:
    // The library writes a line for each popup on purpose; the scene has to be silent.
    void verifyPopupLines(const QStringList &popups)
    {
        QStringList expected;
        for (const QString &popup : popups) {
            expected.append("virtual void HmiStateMachine::PopupState::showPopup(bool)  target "
                            "name  \""
                            + popup + '"');
        }
        QStringList found;
        const auto messages = this->messages().takeMessages();
        for (const Message &message : messages) {
            found.append(message.text);
        }
        QCOMPARE(found, expected);
        QCOMPARE(s_console, QStringList());
    }

    QtMessageHandler m_previous = nullptr;
};

void tst_QuickStart::initTestCase()
{
    m_previous = qInstallMessageHandler(&keepMessage);
}

void tst_QuickStart::theHomeScreenComesFirstAndLeadsNowhereBack()
{
    Application app;

    QCOMPARE(app.visibleScreens(), QStringList("Home"));
    QCOMPARE(app.visiblePopups(), QStringList());
    QCOMPARE(app.window->size(), QSize(800, 480));
    QVERIFY(!buttonIn(app.window->contentItem(), "‹ Back"));
    verifyPopupLines({});
}

void tst_QuickStart::eachButtonLeadsOnAndBackLeadsBack()
{
    Application app;

    app.press("Stations");
    QCOMPARE(app.visibleScreens(), QStringList("Stations"));
    app.press("Bay Jazz");
    QCOMPARE(app.visibleScreens(), QStringList("Bay Jazz, 94.7 MHz"));
    app.press("‹ Back");
    QCOMPARE(app.visibleScreens(), QStringList("Stations"));
    app.press("‹ Back");
    QCOMPARE(app.visibleScreens(), QStringList("Home"));
    QVERIFY(!buttonIn(app.window->contentItem(), "‹ Back"));
    verifyPopupLines({});
}

void tst_QuickStart::aStationIsShownByTheDataOfTheRequest_data()
{
    QTest::addColumn<QStringList>("presses");
    QTest::addColumn<QString>("title");

    QTest::newRow("first of the list")
        << QStringList{"Stations", "Bay Jazz"} << "Bay Jazz, 94.7 MHz";
    QTest::newRow("second") << QStringList{"Stations", "City News"} << "City News, 98.4 MHz";
    QTest::newRow("third") << QStringList{"Stations", "Harbour"} << "Harbour, 101.2 MHz";
    QTest::newRow("from the home screen") << QStringList{"News"} << "City News, 98.4 MHz";
}

void tst_QuickStart::aStationIsShownByTheDataOfTheRequest()
{
    QFETCH(QStringList, presses);
    QFETCH(QString, title);
    Application app;

    for (const QString &button : qAsConst(presses)) {
        app.press(button);
    }

    QCOMPARE(app.visibleScreens(), QStringList(title));
}

void tst_QuickStart::theVolumeLiesOverTheQuestionAndGoesByItself()
{
    Application app;
    app.press("News");

    app.press("Turn off");
    QCOMPARE(app.visiblePopups(), QStringList("Turn City News off?"));
    app.press("Vol +");
    QCOMPARE(app.visiblePopups(), QStringList({"Turn City News off?", "Volume 13"}));
    QCOMPARE(titleIn(app.popups->topItem()), QString("Volume 13"));
    auto *timer = PopupState::stateForTarget("Volume")->findChild<QTimer *>();
    QCOMPARE(timer->interval(), 3000);
    QVERIFY(fire(timer));
    settle();
    QCOMPARE(app.visiblePopups(), QStringList("Turn City News off?"));
    QCOMPARE(titleIn(app.popups->topItem()), QString("Turn City News off?"));
    verifyPopupLines({"TurnOff", "Volume"});
}

void tst_QuickStart::eachPressChangesTheVolume()
{
    Application app;

    app.press("Vol +");
    app.press("Vol +");
    QCOMPARE(app.visiblePopups(), QStringList("Volume 14"));
    app.press("Vol −");
    QCOMPARE(app.visiblePopups(), QStringList("Volume 13"));
    verifyPopupLines({"Volume"});
}

void tst_QuickStart::theQuestionIsAnswered_data()
{
    QTest::addColumn<QString>("answer");
    QTest::addColumn<QString>("title");

    QTest::newRow("yes") << "Yes"
                         << "Home";
    QTest::newRow("no") << "No"
                        << "City News, 98.4 MHz";
}

void tst_QuickStart::theQuestionIsAnswered()
{
    QFETCH(QString, answer);
    QFETCH(QString, title);
    Application app;
    app.press("News");
    app.press("Turn off");

    app.press(answer);

    QCOMPARE(app.visiblePopups(), QStringList());
    QCOMPARE(app.visibleScreens(), QStringList(title));
    verifyPopupLines({"TurnOff"});
}

void tst_QuickStart::theQuestionKeepsTheScreenFromBeingPressed()
{
    Application app;
    app.press("News");
    const QPointF back = app.placeOf("‹ Back");
    app.press("Turn off");

    app.press(back);

    QCOMPARE(app.visibleScreens(), QStringList("City News, 98.4 MHz"));
    QCOMPARE(app.visiblePopups(), QStringList("Turn City News off?"));
    verifyPopupLines({"TurnOff"});
}

void tst_QuickStart::screensMoveForwardsAndBack()
{
    Application app;
    QSignalSpy started(&app.viewLayer, &ViewStateTarget::viewAnimationStarted);
    QSignalSpy shown(&app.viewLayer, &ViewStateTarget::viewActivated);
    QVERIFY(started.isValid() && shown.isValid());
    app.setDuration(50);

    app.press("Stations");
    QTRY_COMPARE(shown.size(), 1);
    app.press("‹ Back");
    QTRY_COMPARE(shown.size(), 2);

    QCOMPARE(started, QList<QVariantList>({{"Stations", 1}, {"Home", 2}}));
    QCOMPARE(shown, QList<QVariantList>({{"Home", "Stations"}, {"Stations", "Home"}}));
    QCOMPARE(app.visibleScreens(), QStringList("Home"));
    verifyPopupLines({});
}

void tst_QuickStart::cleanupTestCase()
{
    qInstallMessageHandler(m_previous);
    QCOMPARE(s_console, QStringList()); // nor as the last scene went
}

QTEST_MAIN(tst_QuickStart)
#include "tst_quickstart.moc"
