#include "cockpit.h"
#include "rules.h"
#include "scene/services.h"
#include "seenbyuser.h"

#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachineQuick/hostattached.h>
#include <HmiStateMachineQuick/popuphost.h>
#include <HmiStateMachineQuick/requests.h>
#include <HmiStateMachineQuick/screenhost.h>

#include <QGuiApplication>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QSignalSpy>
#include <QTest>

#include <algorithm>
#include <memory>

#include <qqml.h>

using namespace headunit;
using namespace HmiStateMachine;

namespace {

constexpr int patienceMs = 30000; // sanitizers are slow

/** Where screens were while they moved in. */
class Movements : public QObject
{
public:
    explicit Movements(ScreenHost *host)
    {
        connect(host, &ScreenHost::currentItemChanged, this, [this, host] {
            QQuickItem *item = host->currentItem();
            auto *attached =
                qobject_cast<HostAttached *>(qmlAttachedPropertiesObject<ScreenHost>(item));
            connect(attached, &HostAttached::positionChanged, this,
                    [this, attached] { positions.append(attached->position()); });
            connect(item, &QQuickItem::xChanged, this, [this, item] { places.append(item->x()); });
        });
    }

    QVector<qreal> positions;
    QVector<qreal> places;
};

bool cameFromTheRight(const QVector<qreal> &values)
{
    return values.size() > 2 && values.first() > 0 && qFuzzyIsNull(values.last())
        && std::is_sorted(values.crbegin(), values.crend());
}

bool cameFromTheLeft(const QVector<qreal> &values)
{
    return values.size() > 2 && values.first() < 0 && qFuzzyIsNull(values.last())
        && std::is_sorted(values.cbegin(), values.cend());
}

} // namespace

/** A person at the keyboard and the screen: everything is done by input, and seen in the scene. */
class tst_SceneInput : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void cleanupTestCase();

    void digitsOpenTheDomains_data();
    void digitsOpenTheDomains();
    void softKeysOpenTheDomains_data();
    void softKeysOpenTheDomains();
    void screensComeFromTheRightAndBackFromTheLeft();
    void backKeysOfTheComputerLeadBack_data();
    void backKeysOfTheComputerLeadBack();
    void backKeyHeldLeadsAllTheWayHome();
    void hardKeysWorkWhenTouched();
    void hardKeyHeldByTouchLeadsAllTheWayHome();
    void fingerThatSlidesOffAHardKeyMeansNothing();
    void phoneKeyOpensThePhone();
    void volumeKeyMutes();
    void listOfKeysNamesEachKey();
    void rowOfAListIsTaken();
    void sourceIsSelectedByTouch();
    void popupAboveAnotherCoversItUntilItIsDismissed();
    void overlayStaysBeforeTheOtherLayersPopup();
    void modalPopupKeepsTouchesFromTheScreen();
    void noteLeavesTheScreenUsable();
    void refusedPopupIsLogged();
    void videoIsRefusedWhileDriving();
    void hintGoesWithTheNextRequest();
    void rearCameraFollowsTheGear();
    void restrictionSignLetsTheCarDriveAndStop();
    void panelsListWhatIsGoingOn();
    void panelsFoldInAndOut();

private:
    QQuickItem *seen(const QString &objectName) const;
    void click(const QString &objectName);
    void clickOn(QQuickItem *item);
    QPoint centreOf(const QQuickItem *item) const;
    void type(Qt::Key key);
    bool shows(const QString &viewId) const;
    bool rests() const;
    QQuickItem *popup(const QString &popupId) const;
    QString lastRequest(int role) const;
    bool lastWasAccepted() const;
    QStringList textsOfSection(const QString &title) const;

    std::unique_ptr<Cockpit> m_cockpit;
    std::unique_ptr<Services> m_services;
    QQuickWindow *m_window = nullptr;
    ScreenHost *m_screens = nullptr;
    PopupHost *m_popups = nullptr;
    QStringList m_warnings;
};

void tst_SceneInput::initTestCase()
{
    m_cockpit = std::make_unique<Cockpit>(personTiming, Scene::RunningTime);
    QVERIFY(!loadRules(builtInRules()));
    m_services = std::make_unique<Services>(&m_cockpit->vehicle);
    StateMachine::instance()->start();
    QVERIFY(!m_cockpit->scene->open(false));
    m_window = m_cockpit->scene->window();
    m_screens = m_window->findChild<ScreenHost *>("screenHost");
    m_popups = m_window->findChild<PopupHost *>("popupHost");
    connect(qmlEngine(m_screens), &QQmlEngine::warnings, this,
            [this](const QList<QQmlError> &errors) {
                for (const QQmlError &error : errors) {
                    m_warnings.append(error.toString());
                }
            });
    m_window->requestActivate();
    QTRY_VERIFY_WITH_TIMEOUT(m_window->isActive(), patienceMs);
    QCOMPARE(m_cockpit->viewLayer.activeView(), Identifier("Home/Welcome"));

    m_cockpit->vehicle.setReady(true);
    m_cockpit->vehicle.setPhoneConnected(true);

    QTRY_VERIFY_WITH_TIMEOUT(shows("Home/Main"), patienceMs);
}

// Everyone begins at home, in a car that stands, without a popup and with the panels in.
void tst_SceneInput::init()
{
    m_cockpit->vehicle.setSpeed(0);
    m_cockpit->vehicle.setGear("P");
    m_window->setProperty("panelsShown", false);
    QTRY_COMPARE_WITH_TIMEOUT(m_window->width(), 1280, patienceMs);
    m_cockpit->viewLayer.requests()->event("CallEnded");
    m_cockpit->viewLayer.requests()->dismissAny();
    m_cockpit->viewLayer.requests()->view("Home/Main");
    QTRY_COMPARE_WITH_TIMEOUT(m_cockpit->viewLayer.shownPopups()->count(), 0, patienceMs);
    QTRY_VERIFY_WITH_TIMEOUT(shows("Home/Main"), patienceMs);
}

void tst_SceneInput::cleanup()
{
    QTRY_VERIFY_WITH_TIMEOUT(rests(), patienceMs);
    QTRY_COMPARE_WITH_TIMEOUT(wrongInScene(m_window, &m_cockpit->viewLayer), QString(), patienceMs);
    QCOMPARE(m_warnings, QStringList());
}

void tst_SceneInput::cleanupTestCase()
{
    m_services.reset();
    m_cockpit.reset();
    QCOMPARE(m_warnings, QStringList());
}

void tst_SceneInput::digitsOpenTheDomains_data()
{
    QTest::addColumn<Qt::Key>("key");
    QTest::addColumn<QString>("viewId");
    QTest::newRow("2") << Qt::Key_2 << "Media/Sources";
    QTest::newRow("3") << Qt::Key_3 << "Phone/Favourites";
    QTest::newRow("4") << Qt::Key_4 << "Navigation/Map";
    QTest::newRow("5") << Qt::Key_5 << "Settings/Main";
}

void tst_SceneInput::digitsOpenTheDomains()
{
    QFETCH(Qt::Key, key);
    QFETCH(QString, viewId);

    type(key);
    QTRY_VERIFY_WITH_TIMEOUT(shows(viewId), patienceMs);
    type(Qt::Key_1);

    QTRY_VERIFY_WITH_TIMEOUT(shows("Home/Main"), patienceMs);
}

void tst_SceneInput::softKeysOpenTheDomains_data()
{
    QTest::addColumn<QString>("domain");
    QTest::addColumn<QString>("viewId");
    QTest::newRow("Media") << "Media"
                           << "Media/Sources";
    QTest::newRow("Phone") << "Phone"
                           << "Phone/Favourites";
    QTest::newRow("Navigation") << "Navigation"
                                << "Navigation/Map";
    QTest::newRow("Settings") << "Settings"
                              << "Settings/Main";
}

void tst_SceneInput::softKeysOpenTheDomains()
{
    QFETCH(QString, domain);
    QFETCH(QString, viewId);

    click("domain-" + domain);

    QTRY_VERIFY_WITH_TIMEOUT(shows(viewId), patienceMs);
    QCOMPARE(seen("status-domain")->property("text").toString(), domain);
    QVERIFY(seen("domain-" + domain)->property("current").toBool());
    QVERIFY(!seen("domain-Home")->property("current").toBool());
}

void tst_SceneInput::screensComeFromTheRightAndBackFromTheLeft()
{
    Movements forwards(m_screens);
    click("tile-apps");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Home/Apps"), patienceMs);
    QVERIFY(cameFromTheRight(forwards.positions));
    QVERIFY(cameFromTheRight(forwards.places));

    Movements back(m_screens);
    click("button-back");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Home/Main"), patienceMs);
    QVERIFY(cameFromTheLeft(back.positions));
    QVERIFY(cameFromTheLeft(back.places));
}

void tst_SceneInput::backKeysOfTheComputerLeadBack_data()
{
    QTest::addColumn<Qt::Key>("key");
    QTest::newRow("B") << Qt::Key_B;
    QTest::newRow("Escape") << Qt::Key_Escape;
    QTest::newRow("Backspace") << Qt::Key_Backspace;
}

void tst_SceneInput::backKeysOfTheComputerLeadBack()
{
    QFETCH(Qt::Key, key);
    click("domain-Media");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);
    click("domain-Settings");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Settings/Main"), patienceMs);
    Movements movements(m_screens);

    type(key);

    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);
    QVERIFY(cameFromTheLeft(movements.positions));
}

void tst_SceneInput::backKeyHeldLeadsAllTheWayHome()
{
    click("domain-Media");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);
    click("domain-Settings");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Settings/Main"), patienceMs);

    QTest::keyPress(m_window, Qt::Key_B);
    QTRY_VERIFY_WITH_TIMEOUT(shows("Home/Main"), patienceMs); // while it is still down
    QTest::keyRelease(m_window, Qt::Key_B);

    QCOMPARE(lastRequest(RequestLog::RequestRole), QString("key Back 0"));
}

void tst_SceneInput::hardKeysWorkWhenTouched()
{
    click("domain-Media");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);
    click("domain-Settings");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Settings/Main"), patienceMs);

    click("key-Back");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);
    click("key-Home");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Home/Main"), patienceMs);
    click("key-Phone");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Phone/Favourites"), patienceMs);
    click("key-Volume");
    QTRY_COMPARE_WITH_TIMEOUT(seen("status-audio")->property("audio").toString(), QString("Muted"),
                              patienceMs);
    click("key-Volume");
    QTRY_COMPARE_WITH_TIMEOUT(seen("status-audio")->property("audio").toString(),
                              QString("Playing"), patienceMs);
}

void tst_SceneInput::hardKeyHeldByTouchLeadsAllTheWayHome()
{
    click("domain-Media");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);
    click("domain-Settings");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Settings/Main"), patienceMs);
    const QPoint key = centreOf(seen("key-Back"));

    QTest::mousePress(m_window, Qt::LeftButton, Qt::NoModifier, key);
    QTRY_VERIFY_WITH_TIMEOUT(shows("Home/Main"), patienceMs);
    QTest::mouseRelease(m_window, Qt::LeftButton, Qt::NoModifier, key);

    QCOMPARE(lastRequest(RequestLog::RequestRole), QString("key Back 0"));
}

void tst_SceneInput::fingerThatSlidesOffAHardKeyMeansNothing()
{
    click("domain-Media");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);
    const QSignalSpy requests(m_cockpit->viewLayer.requests(), &Requests::requested);
    const QPoint key = centreOf(seen("key-Home"));
    const QPoint beside = key + QPoint(400, 0);

    QTest::mousePress(m_window, Qt::LeftButton, Qt::NoModifier, key);
    QTest::mouseMove(m_window, beside);
    QTest::mouseRelease(m_window, Qt::LeftButton, Qt::NoModifier, beside);

    QCOMPARE(requests.size(), 0);
    QVERIFY(shows("Media/Sources"));
}

void tst_SceneInput::phoneKeyOpensThePhone()
{
    type(Qt::Key_P);
    QTRY_VERIFY_WITH_TIMEOUT(shows("Phone/Favourites"), patienceMs);
    type(Qt::Key_H);

    QTRY_VERIFY_WITH_TIMEOUT(shows("Home/Main"), patienceMs);
}

void tst_SceneInput::volumeKeyMutes()
{
    const QQuickItem *audio = seen("status-audio");

    type(Qt::Key_V);
    QTRY_COMPARE_WITH_TIMEOUT(audio->property("audio").toString(), QString("Muted"), patienceMs);
    QVERIFY(m_cockpit->inspector->activeStates().contains("Audio/Muted"));
    type(Qt::Key_V);

    QTRY_COMPARE_WITH_TIMEOUT(audio->property("audio").toString(), QString("Playing"), patienceMs);
}

void tst_SceneInput::listOfKeysNamesEachKey()
{
    QVERIFY(!seen("keyHelp"));

    type(Qt::Key_F1);
    QVERIFY(seen("keyHelp"));
    const QStringList texts = seenTexts(seen("keyHelp"));
    for (const char *key : {"H", "B", "Esc", "P", "V", "1", "5", "↑", "↓", "F1", "F2"}) {
        QVERIFY2(texts.contains(key), key);
    }
    const QString all = texts.join('\n');
    for (const QString &name : HardKeys::names()) {
        QVERIFY2(all.contains(name + " key"), qPrintable(name));
    }
    type(Qt::Key_F1);
    QVERIFY(!seen("keyHelp"));

    type(Qt::Key_F1);
    clickOn(seen("keyHelp"));
    QVERIFY(!seen("keyHelp"));
}

void tst_SceneInput::rowOfAListIsTaken()
{
    click("domain-Phone");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Phone/Favourites"), patienceMs);
    click("button-contacts");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Phone/Contacts"), patienceMs);
    const QString name = seenTexts(seen("contact-1")).join(' ');

    click("contact-1");

    QTRY_VERIFY_WITH_TIMEOUT(shows("Phone/ContactDetails"), patienceMs);
    QVERIFY(name.contains(seen("contact-name")->property("text").toString()));
}

void tst_SceneInput::sourceIsSelectedByTouch()
{
    click("domain-Media");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);

    click("button-radio");
    QTRY_VERIFY_WITH_TIMEOUT(m_cockpit->inspector->activeStates().contains("Media/Connecting"),
                             patienceMs);
    QVERIFY(shows("Media/Sources")); // stays while the source connects

    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Browser"), patienceMs);
}

void tst_SceneInput::popupAboveAnotherCoversItUntilItIsDismissed()
{
    type(Qt::Key_F2);
    click("provoke-traffic");
    QTRY_VERIFY_WITH_TIMEOUT(rests() && popup("navigation/traffic"), patienceMs);
    QQuickItem *lower = popup("navigation/traffic");
    QVERIFY(isSeen(lower));

    click("provoke-parking");
    QTRY_VERIFY_WITH_TIMEOUT(rests() && popup("car/parking"), patienceMs);
    QQuickItem *upper = popup("car/parking");
    QCOMPARE(popup("navigation/traffic"), lower);
    QVERIFY(isSeen(upper));
    QVERIFY(!lower->isVisible());
    QVERIFY(upper->z() > lower->z());
    QCOMPARE(m_popups->topItem(), upper);
    QCOMPARE(m_cockpit->viewLayer.stackedPopups(), QStringList("navigation/traffic"));

    clickOn(seenItem(upper, "dismiss"));
    QTRY_VERIFY_WITH_TIMEOUT(rests() && isSeen(lower), patienceMs);
    QCOMPARE(m_popups->topItem(), lower);
    QTRY_VERIFY_WITH_TIMEOUT(!popup("car/parking"), patienceMs);

    clickOn(seenItem(lower, "dismiss"));
    QTRY_VERIFY_WITH_TIMEOUT(!m_popups->topItem(), patienceMs);
}

void tst_SceneInput::overlayStaysBeforeTheOtherLayersPopup()
{
    type(Qt::Key_F2);
    click("provoke-traffic");
    QTRY_VERIFY_WITH_TIMEOUT(rests() && popup("navigation/traffic"), patienceMs);

    click("provoke-volume");

    QTRY_VERIFY_WITH_TIMEOUT(rests() && popup("media/volume"), patienceMs);
    QVERIFY(isSeen(popup("navigation/traffic")));
    QVERIFY(isSeen(popup("media/volume")));
    QVERIFY(popup("media/volume")->z() > popup("navigation/traffic")->z());
    QCOMPARE(m_popups->topItem(), popup("media/volume"));
    QCOMPARE(seen("volumeLevel")->property("text").toString(), QString("11"));
    QTRY_VERIFY_WITH_TIMEOUT(!popup("media/volume"), patienceMs); // goes by itself
    QCOMPARE(m_popups->topItem(), popup("navigation/traffic"));
}

void tst_SceneInput::modalPopupKeepsTouchesFromTheScreen()
{
    type(Qt::Key_F2);
    click("provoke-traffic");
    QTRY_VERIFY_WITH_TIMEOUT(rests() && popup("navigation/traffic"), patienceMs);
    const QSignalSpy requests(m_cockpit->viewLayer.requests(), &Requests::requested);

    click("tile-apps");
    click("tile-phone");
    click("domain-Media");

    QCOMPARE(requests.size(), 0);
    QVERIFY(isSeen(popup("navigation/traffic")));
    QVERIFY(shows("Home/Main"));
    click("key-Phone"); // hard keys work
    QTRY_VERIFY_WITH_TIMEOUT(shows("Phone/Favourites"), patienceMs);
}

void tst_SceneInput::noteLeavesTheScreenUsable()
{
    type(Qt::Key_F2);
    click("provoke-mediaLost");
    QTRY_VERIFY_WITH_TIMEOUT(rests() && popup("media/lost"), patienceMs);

    click("tile-apps");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Home/Apps"), patienceMs);
    QVERIFY(isSeen(popup("media/lost")));
    clickOn(seenItem(popup("media/lost"), "dismiss"));

    QTRY_VERIFY_WITH_TIMEOUT(!popup("media/lost"), patienceMs);
}

void tst_SceneInput::refusedPopupIsLogged()
{
    type(Qt::Key_F2);
    click("provoke-callBanner");
    QTRY_VERIFY_WITH_TIMEOUT(rests() && popup("CallBanner"), patienceMs);
    QVERIFY(lastWasAccepted());

    click("provoke-traffic");

    QTRY_VERIFY_WITH_TIMEOUT(!lastWasAccepted(), patienceMs);
    QCOMPARE(lastRequest(RequestLog::RequestRole), QString("popup navigation/traffic"));
    QCOMPARE(lastRequest(RequestLog::OutcomeRole), QString("refused by phone/call"));
    QVERIFY(!popup("navigation/traffic"));
    QVERIFY(textsOfSection("Requests").contains("refused by phone/call"));
}

void tst_SceneInput::videoIsRefusedWhileDriving()
{
    click("domain-Media");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);
    click("button-player");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Player"), patienceMs);
    type(Qt::Key_Up);
    QCOMPARE(m_cockpit->vehicle.speed(), 10);

    click("button-video");
    QTRY_VERIFY_WITH_TIMEOUT(seen("hint"), patienceMs);
    QCOMPARE(seen("hint-text")->property("text").toString(),
             QString("Videos are not shown while driving."));
    QVERIFY(!lastWasAccepted());
    QCOMPARE(lastRequest(RequestLog::OutcomeRole), QString("no video while driving"));
    QVERIFY(shows("Media/Player"));

    type(Qt::Key_Down);
    click("button-video");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Video"), patienceMs);
    QTRY_VERIFY_WITH_TIMEOUT(!seen("hint"), patienceMs);
    type(Qt::Key_Up);
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Player"), patienceMs);
}

void tst_SceneInput::hintGoesWithTheNextRequest()
{
    click("domain-Navigation");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Navigation/Map"), patienceMs);
    type(Qt::Key_Up);
    click("button-search-field");
    QTRY_VERIFY_WITH_TIMEOUT(seen("hint"), patienceMs);
    QCOMPARE(seen("hint-text")->property("text").toString(),
             QString("No typing while driving. Say where you want to go."));

    click("button-traffic");

    QTRY_VERIFY_WITH_TIMEOUT(!seen("hint"), 2000); // by itself it would stay longer
}

void tst_SceneInput::rearCameraFollowsTheGear()
{
    click("domain-Media");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);
    type(Qt::Key_F2);

    click("gear-R");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Home/RearCamera"), patienceMs);
    QVERIFY(m_cockpit->vehicle.isReversing());
    type(Qt::Key_B); // is blocked
    type(Qt::Key_2); // is no way out either
    click("provoke-parking");
    QTRY_VERIFY_WITH_TIMEOUT(rests() && popup("car/parking"), patienceMs);
    QVERIFY(shows("Home/RearCamera"));

    click("gear-D");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);
}

void tst_SceneInput::restrictionSignLetsTheCarDriveAndStop()
{
    type(Qt::Key_F2);
    click("provoke-update");
    QTRY_VERIFY_WITH_TIMEOUT(rests() && popup("system/update"), patienceMs);

    click("restriction");
    QTRY_VERIFY_WITH_TIMEOUT(rests() && !popup("system/update"), patienceMs);
    QVERIFY(m_cockpit->vehicle.isMoving());

    click("restriction");
    QTRY_VERIFY_WITH_TIMEOUT(!m_cockpit->vehicle.isMoving(), patienceMs);
}

void tst_SceneInput::panelsListWhatIsGoingOn()
{
    type(Qt::Key_F2);
    QTRY_VERIFY_WITH_TIMEOUT(seen("section-Active states"), patienceMs);
    click("domain-Media");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Media/Sources"), patienceMs);
    click("domain-Settings");
    QTRY_VERIFY_WITH_TIMEOUT(shows("Settings/Main"), patienceMs);
    click("provoke-traffic");
    QTRY_VERIFY_WITH_TIMEOUT(rests() && popup("navigation/traffic"), patienceMs);

    const QStringList states = textsOfSection("Active states");
    for (const char *state : {"HeadUnit", "Screens", "Settings", "Settings/Main", "Alerts",
                              "Guidance/Idle", "Audio/Playing", "Keys", "navigation/traffic"}) {
        QVERIFY2(states.contains(state), state);
    }
    QVERIFY(!states.contains("Media/Sources"));
    QVERIFY(textsOfSection("Back").contains("Media/Sources"));
    QVERIFY(textsOfSection("Popups").contains("navigation/traffic"));
    QVERIFY(textsOfSection("Popups").contains("1 shown, 0 waiting"));
    const QStringList requests = textsOfSection("Requests");
    QVERIFY(requests.contains("view Settings"));
    QVERIFY(requests.contains("shows Settings/Main"));
    QVERIFY(requests.contains("popup navigation/traffic"));
}

void tst_SceneInput::panelsFoldInAndOut()
{
    click("button-panels");
    QTRY_VERIFY_WITH_TIMEOUT(seen("gear-R") && seen("section-Requests"), patienceMs);
    QTRY_COMPARE_WITH_TIMEOUT(m_window->size(), QSize(1700, 900), patienceMs);
    QVERIFY(textsOfSection("Active states").contains("HeadUnit"));
    click("fold-Active states");
    QVERIFY(!textsOfSection("Active states").contains("HeadUnit"));

    click("button-panels");

    QTRY_VERIFY_WITH_TIMEOUT(!seen("gear-R") && !seen("section-Requests"), patienceMs);
    QTRY_COMPARE_WITH_TIMEOUT(m_window->size(), QSize(1280, 720), patienceMs);
}

QQuickItem *tst_SceneInput::seen(const QString &objectName) const
{
    return seenItem(m_window->contentItem(), objectName);
}

void tst_SceneInput::click(const QString &objectName)
{
    QTRY_VERIFY2_WITH_TIMEOUT(seen(objectName), qPrintable("not to be seen: " + objectName),
                              patienceMs);
    clickOn(seen(objectName));
}

void tst_SceneInput::clickOn(QQuickItem *item)
{
    QVERIFY(item);
    QTest::mouseClick(m_window, Qt::LeftButton, Qt::NoModifier, centreOf(item));
}

QPoint tst_SceneInput::centreOf(const QQuickItem *item) const
{
    return item->mapToScene(QPointF(item->width() / 2, item->height() / 2)).toPoint();
}

void tst_SceneInput::type(Qt::Key key)
{
    QTest::keyClick(m_window, key);
}

bool tst_SceneInput::shows(const QString &viewId) const
{
    const QQuickItem *screen = m_screens->currentItem();
    return rests() && screen && isSeen(screen) && screen->x() == 0
        && screen->property("viewId") == viewId;
}

bool tst_SceneInput::rests() const
{
    return !m_cockpit->viewLayer.isTransitioning();
}

QQuickItem *tst_SceneInput::popup(const QString &popupId) const
{
    const auto items = m_popups->childItems();
    for (QQuickItem *item : items) {
        if (item->property("popupId") == popupId) {
            return item;
        }
    }
    return nullptr;
}

QString tst_SceneInput::lastRequest(int role) const
{
    const RequestLog *log = m_cockpit->inspector->requests();
    return log->data(log->index(0), role).toString();
}

bool tst_SceneInput::lastWasAccepted() const
{
    const RequestLog *log = m_cockpit->inspector->requests();
    return log->data(log->index(0), RequestLog::AcceptedRole).toBool();
}

QStringList tst_SceneInput::textsOfSection(const QString &title) const
{
    return seenTexts(seen("section-" + title));
}

int main(int argc, char *argv[])
{
    qputenv("QSG_RENDER_LOOP", "basic"); // as the program has it
    QGuiApplication app(argc, argv);
    tst_SceneInput test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_sceneinput.moc"
