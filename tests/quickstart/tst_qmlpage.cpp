#include "driving.h"
#include "librarytest.h"
#include "snippets/textpresenter.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupstate.h>
#include <HmiStateMachineQuick/popuphost.h>
#include <HmiStateMachineQuick/requests.h>
#include <HmiStateMachineQuick/screenhost.h>

#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QtTest>

#include <memory>

using namespace HmiStateMachine;

namespace {

/** Two views and two popups in StateMachine::instance(). */
struct Flow
{
    Flow()
    {
        auto *screens = new HmiLayeredState("Screens", StateMachine::instance());
        screens->setInitialHmiState(new HmiViewState("Home", screens));
        (new HmiViewState("Radio", screens))->setHandlesBackEvent(true);
        new PopupState("FuelWarning", screens, 2);
        new PopupState("Note", screens, 4);
        startIn(*StateMachine::instance(), screens);
    }

    ~Flow()
    {
        park(*StateMachine::instance());
        delete NamedState::stateForName("Screens");
    }
};

} // namespace

class tst_QmlPage : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void theSceneOfThePageShowsWhatItSays();
    void thePresenterOfThePageShowsLines();
};

void tst_QmlPage::theSceneOfThePageShowsWhatItSays()
{
    QuickViewStateTarget target;
    QSignalSpy failed(&target, &QuickViewStateTarget::loadFailed);
    QQmlEngine engine;
    QStringList warnings;
    connect(&engine, &QQmlEngine::warnings, this, [&warnings](const QList<QQmlError> &errors) {
        for (const QQmlError &error : errors) {
            warnings.append(error.toString());
        }
    });
    QQmlComponent component(&engine, QUrl::fromLocalFile(SNIPPETS_DIR "/Scene.qml"));
    std::unique_ptr<QObject> scene(component.create());
    QVERIFY2(scene, qPrintable(component.errorString()));
    auto *screens = scene->findChild<ScreenHost *>();
    auto *popups = scene->findChild<PopupHost *>();
    screens->setProperty("duration", 0);
    popups->setProperty("duration", 0);
    Flow flow;

    target.requests()->view("Radio", QVariantMap{{"band", "FM"}});
    settle();
    QCOMPARE(screens->currentItem()->property("viewId").toString(), QString("Radio"));
    QCOMPARE(screens->currentItem()->opacity(), 1.0);
    target.requests()->popup("Note", "Rain ahead");
    settle();
    QCOMPARE(popups->topItem()->property("text").toString(), QString("Rain ahead"));
    target.requests()->popup("FuelWarning");
    settle();
    QCOMPARE(popups->topItem()->property("totalTime"), QVariant(0));

    QCOMPARE(warnings, QStringList());
    QCOMPARE(failed.size(), 0);
    messages().take(); // a line for each popup
}

void tst_QmlPage::thePresenterOfThePageShowsLines()
{
    QuickViewStateTarget target;
    TextPresenter presenter(&target);
    QSignalSpy activated(&target, &ViewStateTarget::viewActivated);
    Flow flow;

    target.requests()->view("Radio");
    target.requests()->popup("Note");
    target.requests()->dismiss("Note");
    target.requests()->back();
    settle();

    QCOMPARE(presenter.lines,
             QStringList({"show Home", "show Radio", "show Note", "hide Note", "back at Home"}));
    QCOMPARE(activated.size(), 3);
    messages().take();
}

QTEST_MAIN(tst_QmlPage)
#include "tst_qmlpage.moc"
