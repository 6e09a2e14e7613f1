// Three screens, data, and a way back, on what Qt has.

#include <QAbstractTransition>
#include <QCoreApplication>
#include <QDebug>
#include <QStack>
#include <QState>
#include <QStateMachine>
#include <QVariant>

struct ViewEvent : QEvent
{
    static constexpr Type eventType = Type(User + 1);
    ViewEvent(const QString &v, const QVariant &info) : QEvent(eventType), view(v), data(info) { }
    const QString view;
    const QVariant data;
};

struct BackEvent : QEvent
{
    static constexpr Type eventType = Type(User + 2);
    BackEvent() : QEvent(eventType) { }
};

class View : public QState
{
public:
    View(const QString &name, QState *parent) : QState(parent) { setObjectName(name); }

    static QStack<View *> s_trail; // where back leads

protected:
    void onEntry(QEvent *event) override
    {
        const bool requested = event->type() == ViewEvent::eventType;
        const QVariant data = requested ? static_cast<ViewEvent *>(event)->data : QVariant();
        qInfo().noquote() << "  show " + objectName()
                + (data.isValid() ? ": " + data.toString() : "");
    }

    void onExit(QEvent *event) override
    {
        if (event->type() != BackEvent::eventType) {
            s_trail.push(this);
        }
        qInfo().noquote() << "  leave " + objectName();
    }
};

QStack<View *> View::s_trail;

// On the state around all views; internal, so that a request leaves the active view alone.
class ViewTransition : public QAbstractTransition
{
public:
    ViewTransition(View *target, QState *source) : QAbstractTransition(source)
    {
        setTargetState(target);
        setTransitionType(InternalTransition);
    }

protected:
    bool eventTest(QEvent *event) override
    {
        return event->type() == ViewEvent::eventType
            && static_cast<ViewEvent *>(event)->view == targetState()->objectName()
            && !static_cast<View *>(targetState())->active();
    }
    void onTransition(QEvent *) override { }
};

class BackTransition : public QAbstractTransition
{
public:
    using QAbstractTransition::QAbstractTransition;

protected:
    bool eventTest(QEvent *event) override
    {
        if (event->type() != BackEvent::eventType || View::s_trail.isEmpty()) {
            return false;
        }
        setTargetState(View::s_trail.top());
        return true;
    }
    void onTransition(QEvent *) override { View::s_trail.pop(); }
};

static void request(QStateMachine *machine, const QString &text, QEvent *event)
{
    qInfo().noquote() << text;
    machine->postEvent(event);
    QCoreApplication::sendPostedEvents();
}

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QStateMachine machine;
    auto *screens = new QState(&machine);
    machine.setInitialState(screens);
    auto *home = new View("Home", screens);
    screens->setInitialState(home);
    auto *radio = new View("Radio", screens);
    auto *stations = new View("Stations", screens);
    for (View *view : {home, radio, stations}) {
        new ViewTransition(view, screens);
    }
    new BackTransition(radio); // not on the home screen
    new BackTransition(stations);
    machine.start();
    QCoreApplication::sendPostedEvents();

    request(&machine, "The radio.", new ViewEvent("Radio", "Bay Jazz"));
    request(&machine, "Its stations.", new ViewEvent("Stations", QVariant()));
    request(&machine, "Back.", new BackEvent);
    request(&machine, "Back.", new BackEvent);
    request(&machine, "Back.", new BackEvent);
}
