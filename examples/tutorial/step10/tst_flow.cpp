#include "flow.h"
#include "hardkeys.h"
#include "printing.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QLoggingCategory>
#include <QTimer>
#include <QTimerEvent>
#include <QtTest>

#include <utility>

using namespace HmiStateMachine;

namespace {

class RecordingViewLayer : public PrintingViewLayer
{
public:
    QStringList take() { return std::exchange(m_lines, {}); }

protected:
    void tell(const QString &line) override { m_lines.append(line); }

private:
    QStringList m_lines;
};

// The flow, started; it goes with its states, so that each test has one of its own.
class Flow
{
public:
    Flow()
    {
        s_driving = false;
        buildFlow(&keys);
        run(machine->initialState());
        viewLayer.take();
    }

    ~Flow()
    {
        stop();
        run(new QState(machine)); // or the stopped machine would still point to the flow's states
        stop();
        delete NamedState::stateForName("Screens");
        HmiViewState::setLastKnownViewState(QString());
    }

    QStringList after(QEvent *event)
    {
        machine->postEvent(event);
        QCoreApplication::sendPostedEvents();
        return viewLayer.take();
    }

    StateMachine *machine = StateMachine::instance();
    HardKeys keys;
    RecordingViewLayer viewLayer;

private:
    void stop()
    {
        machine->stop();
        QCoreApplication::sendPostedEvents();
    }

    void run(QAbstractState *initial)
    {
        machine->setInitialState(initial);
        machine->start();
        QCoreApplication::sendPostedEvents();
    }
};

} // namespace

class tst_Flow : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { QLoggingCategory::setFilterRules("*.debug=false"); }
    void backLeadsToTheViewBefore();
    void theVolumeGoesByItself();
    void thereIsNoFilmWhileDriving();
};

void tst_Flow::backLeadsToTheViewBefore()
{
    Flow flow;
    flow.after(new HmiViewEvent("Radio", "Bay Jazz"));
    flow.after(new HmiViewEvent("Stations", QVariant()));

    QCOMPARE(flow.after(new HmiBackEvent(1, QString())),
             QStringList({"leave Stations", "show Radio"}));
}

void tst_Flow::theVolumeGoesByItself()
{
    Flow flow;
    flow.keys.press(HardKeys::Louder);
    QCoreApplication::sendPostedEvents();
    QCOMPARE(flow.viewLayer.take(), QStringList("popup audio/volume: 12"));
    auto *timer = PopupState::stateForTarget("audio/volume")->findChild<QTimer *>();
    QCOMPARE(timer->interval(), 3000);
    QVERIFY(timer->isActive());

    QTimerEvent timeout(timer->timerId());
    QCoreApplication::sendEvent(timer, &timeout);
    QCoreApplication::sendPostedEvents();

    QCOMPARE(flow.viewLayer.take(), QStringList("popup audio/volume goes"));
}

void tst_Flow::thereIsNoFilmWhileDriving()
{
    Flow flow;
    s_driving = true;

    QCOMPARE(flow.after(new HmiEvent("video", QVariant())), QStringList());
    s_driving = false;
    QCOMPARE(flow.after(new HmiEvent("video", QVariant())),
             QStringList({"leave Home", "show Video"}));
}

QTEST_GUILESS_MAIN(tst_Flow)
#include "tst_flow.moc"
