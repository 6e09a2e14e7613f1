// Three screens, the view layer that shows them, and the way back. Ends by itself.

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/named/viewstatetarget.h>

#include <QCoreApplication>
#include <QLoggingCategory>
#include <QMap>
#include <QTextStream>
#include <QTime>

using namespace HmiStateMachine;

namespace {

void print(const QString &line)
{
    QTextStream(stdout) << line << '\n';
}

// The library draws nothing: it tells this object what to show. Here that is a line of text.
class PrintingViewLayer : public ViewStateTarget
{
public:
    PrintingViewLayer() : ViewStateTarget(nullptr) { VIEW_STATE_TARGET_INSTANCE = this; }
    ~PrintingViewLayer() override { VIEW_STATE_TARGET_INSTANCE = nullptr; }

    void activateView(const QString &viewId, const QVariant &instanceData) override
    {
        const QVariant data = instanceData.toMap().value("eventData");
        print("  show " + viewId + (data.isValid() ? ", " + data.toString() : QString()));
        m_activeView = viewId;
    }

    void deactivateView(const QString &viewId, const QVariant &) override
    {
        print("  leave " + viewId);
    }

    // A back request of several steps goes one view at a time: this posts the next step, if any.
    void postFollowOnBackEvent(quint8 depth, const QString &targetId, const QString &id) override
    {
        if (auto *event = HmiBackEvent::followOnEvent(depth, targetId, id)) {
            StateMachine::instance()->postEvent(event);
        }
    }

    Identifier activeView() const override { return m_activeView; }
    int activeDomain() const override { return 0; }
    int domainFromName(const QString &) override { return 0; }

    // There are no popups in this flow.
    void preparePopup(const QString &, bool) override { }
    void requestPopupShow(const QString &, int, const QVariant &) override { }
    void requestPopupHide(const QString &, bool) override { }
    void retryBlockedPopup(PopupState *) override { }
    void releaseBlockedPopups(const QMap<PopupState *, QTime> &) override { }
    void setScreenPopupBehavior(bool) override { }
    void resetScreenPopupBehavior() override { }
    void updatePopupData(const QString &, const QVariant &) override { }

private:
    QString m_activeView;
};

// Posts what a user or the application asks for, and lets the machine carry it out.
void request(const QString &what, QEvent *event)
{
    print(what);
    StateMachine::instance()->postEvent(event);
    QCoreApplication::sendPostedEvents();
}

} // namespace

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QLoggingCategory::setFilterRules("vosk.hmistatemachine.debug=false\n"
                                     "hmi.performance.debug=false\nhmi.trace.debug=false");
    PrintingViewLayer viewLayer;

    StateMachine *machine = StateMachine::instance(); // goes with the application object
    auto *home = new HmiViewState("Home", machine);
    auto *radio = new HmiViewState("Radio", machine);
    auto *stations = new HmiViewState("Stations", machine);
    radio->setHandlesBackEvent(true);
    stations->setHandlesBackEvent(true);

    print("The machine starts.");
    machine->setInitialState(home);
    machine->start();
    QCoreApplication::sendPostedEvents();

    request("The radio is asked for.", new HmiViewEvent("Radio", "98.4 MHz"));
    request("Its stations are asked for.", new HmiViewEvent("Stations", QVariant()));
    request("Back is pressed.", new HmiBackEvent(1, QString()));
    request("The stations again.", new HmiViewEvent("Stations", QVariant()));
    request("Back, two steps at once.", new HmiBackEvent(2, QString()));
    request("Home leads back nowhere.", new HmiBackEvent(1, QString()));

    machine->stop();
    QCoreApplication::sendPostedEvents();
    print("The machine stops.");
    return 0;
}
