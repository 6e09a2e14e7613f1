#include "inspector.h"

#include "refusal.h"
#include "viewlayer.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupstate.h>
#include <HmiStateMachineQuick/requests.h>

#include <QTimer>

using namespace HmiStateMachine;

namespace headunit {

namespace {

// What the library adds to a flow has names of its own.
bool isOfTheFlow(const NamedState *state)
{
    return !state->name().isEmpty() && !state->name().contains("_") && state->name() != "Internal"
        && state->name() != "Exclusive";
}

void collectActive(const QObject *parent, QStringList *names)
{
    for (QObject *child : parent->children()) {
        const auto *state = qobject_cast<const QAbstractState *>(child);
        if (!state || !state->active()) {
            continue;
        }
        const auto *named = qobject_cast<const NamedState *>(child);
        if (named && isOfTheFlow(named)) {
            names->append(named->name());
        }
        collectActive(child, names);
    }
}

QString describe(const QString &kind, const QString &id, const QVariant &data)
{
    QString text = kind;
    if (!id.isEmpty()) {
        text += ' ' + id;
    }
    const bool isNumber = kind == "key" || kind == "back";
    return isNumber ? text + ' ' + data.toString() : text;
}

} // namespace

Inspector::Inspector(ViewLayer *viewLayer, QObject *parent)
    : QObject(parent), m_viewLayer(viewLayer), m_requests(new RequestLog(this)),
      m_updateTimer(new QTimer(this))
{
    m_updateTimer->setSingleShot(true);
    m_updateTimer->setInterval(0); // once for all states that one event leaves and enters
    connect(m_updateTimer, &QTimer::timeout, this, &Inspector::update);
    followStates();
    followRequests();
}

Inspector::~Inspector() = default;

QStringList Inspector::activeStates() const
{
    return m_activeStates;
}

QStringList Inspector::backStack() const
{
    const HmiViewState *view = HmiViewState::activeViewState();
    return view ? m_backStacks.value(view->name()) : QStringList();
}

RequestLog *Inspector::requests() const
{
    return m_requests;
}

void Inspector::begin(const QString &text)
{
    m_outcomes.clear();
    m_accepted = true;
    m_requests->add(text);
    m_requests->setOutcome("nothing changed", true);
}

void Inspector::update()
{
    QStringList names;
    collectActive(StateMachine::instance(), &names);
    if (names != m_activeStates) {
        m_activeStates = names;
        Q_EMIT activeStatesChanged();
    }
    Q_EMIT backStackChanged();
}

void Inspector::followStates()
{
    const auto states = NamedState::namedStates();
    for (NamedState *state : states) {
        follow(state);
        if (auto *view = qobject_cast<HmiViewState *>(state)) {
            follow(view);
        } else if (auto *popup = qobject_cast<PopupState *>(state)) {
            follow(popup);
        }
    }
}

void Inspector::followRequests()
{
    connect(m_viewLayer->requests(), &Requests::requested, this,
            [this](const QString &kind, const QString &id, const QVariant &data) {
                begin(describe(kind, id, data));
            });
    connect(m_viewLayer->requests(), &Requests::warned, this,
            [this](const QString &text) { note(text, false); });
    connect(m_viewLayer, &ViewLayer::hintShown, this, [this](const QString &text) {
        note(text, false);
        Q_EMIT hintShown(text);
    });
    connect(m_viewLayer, &ViewStateTarget::activeViewChanged, this,
            [this](const QString &viewId) { note("shows " + viewId); });
}

void Inspector::follow(NamedState *state)
{
    const auto changed = [this] { m_updateTimer->start(); };
    connect(state, &QAbstractState::entered, this, changed);
    connect(state, &QAbstractState::exited, this, changed);
}

void Inspector::follow(HmiViewState *view)
{
    const QString name = view->name();
    connect(view, &HmiViewState::backStackPush, this, [this, name](const QString &id) {
        m_backStacks[name].prepend(id);
        m_updateTimer->start();
    });
    connect(view, &HmiViewState::backStackPop, this, [this, name] {
        if (!m_backStacks[name].isEmpty()) {
            m_backStacks[name].removeFirst();
        }
        m_updateTimer->start();
    });
    connect(view, &HmiViewState::alreadyActive, this,
            [this, name] { note(name + " is shown already"); });
}

void Inspector::follow(PopupState *popup)
{
    if (popup->name().endsWith(PopupState::noneStatePostfix())) {
        return;
    }
    connect(popup, &QAbstractState::entered, this,
            [this, popup] { note("popup " + popup->popupViewId()); });
    connect(popup, &QAbstractState::exited, this,
            [this, popup] { note(popup->popupViewId() + " left"); });
    connect(popup, &PopupState::alreadyActivated, this,
            [this, popup] { note(popup->popupViewId() + " has new data"); });
    connect(popup, &PopupState::blocked, this, [this, popup] { note(refusalOf(popup), false); });
}

void Inspector::note(const QString &outcome, bool accepted)
{
    m_accepted = m_accepted && accepted;
    m_outcomes.append(outcome);
    m_requests->setOutcome(m_outcomes.join(", "), m_accepted);
}

} // namespace headunit
