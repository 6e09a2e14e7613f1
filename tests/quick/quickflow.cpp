#include "quickflow.h"

#include "driving.h"
#include "messagerecorder.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

QString text(const QString &id)
{
    return id.isEmpty() ? QStringLiteral("none") : id;
}

} // namespace

QuickFlow::QuickFlow(MessageRecorder &messages)
    : m_messages(messages), unit(new NamedState("Unit", QState::ParallelStates, machine)),
      screens(new HmiLayeredState("Screens", unit)), overlay(new HmiLayeredState("Overlay", unit)),
      home(view("Home"))
{
    record();
}

QuickFlow::~QuickFlow()
{
    park(*machine);
    delete unit;
    const auto left = takeMessages();
    for (const QString &message : left) {
        QTest::qFail(qPrintable("Unexpected message: " + message), __FILE__, __LINE__);
    }
}

HmiViewState *QuickFlow::view(const QString &name)
{
    auto *state = new HmiViewState(name, screens);
    state->setHandlesBackEvent(true);
    return state;
}

PopupState *QuickFlow::popup(const QString &name, const QString &viewId, int kind)
{
    auto *state = new PopupState(name, screens, kind);
    state->setPopupViewId(viewId);
    return state;
}

PopupState *QuickFlow::overlayPopup(const QString &name, const QString &viewId, int kind)
{
    auto *state = new PopupState(name, overlay, kind);
    state->setPopupViewId(viewId);
    return state;
}

void QuickFlow::start(HmiViewState *initial)
{
    screens->setInitialHmiState(initial ? initial : home);
    startIn(*machine, unit);
    journal.clear();
}

void QuickFlow::post(QEvent *event)
{
    machine->postEvent(event);
    settle();
    settle(); // for what the target posts to itself meanwhile
}

void QuickFlow::request(const QString &viewId, const QVariant &data)
{
    post(new HmiViewEvent(viewId, data));
}

void QuickFlow::back(int depth, const QString &targetId)
{
    post(new HmiBackEvent(static_cast<unsigned char>(depth), targetId));
}

void QuickFlow::requestPopup(const QString &name, const QVariant &data)
{
    post(new PopupEvent(name, data));
}

void QuickFlow::dismiss(const QString &name)
{
    post(new PopupEvent(name + "_Dismiss", QVariant()));
}

QStringList QuickFlow::take()
{
    const QStringList lines = journal.lines();
    journal.clear();
    return lines;
}

QStringList QuickFlow::takeMessages()
{
    QStringList result;
    const auto messages = m_messages.takeMessages();
    for (const Message &message : messages) {
        if (!message.text.contains("PopupState::showPopup")) {
            result.append(message.text);
        }
    }
    return result;
}

QString QuickFlow::activeView()
{
    const HmiViewState *view = HmiViewState::activeViewState();
    return view ? view->name() : QString();
}

void QuickFlow::record()
{
    const auto add = [this](const QStringList &words) { journal.add(words.join(' ')); };
    const auto views = [add](const QString &signal) {
        return [add, signal](const Identifier &first, const Identifier &second) {
            add({signal, text(first), text(second)});
        };
    };
    const auto animation = [add](const QString &signal) {
        return [add, signal](const Identifier &id, int type) {
            add({signal, id, QString::number(type)});
        };
    };
    const QuickViewStateTarget *t = target.get();
    QObject::connect(t, &ViewStateTarget::activeDomainChanged, t, [add](int to, int from) {
        add({"activeDomainChanged", QString::number(to), QString::number(from)});
    });
    QObject::connect(t, &ViewStateTarget::activeViewChanged, t, views("activeViewChanged"));
    QObject::connect(t, &ViewStateTarget::viewAboutToBeActivated, t,
                     views("viewAboutToBeActivated"));
    QObject::connect(t, &ViewStateTarget::viewActivated, t, views("viewActivated"));
    QObject::connect(t, &ViewStateTarget::viewAnimationStarted, t,
                     animation("viewAnimationStarted"));
    QObject::connect(t, &ViewStateTarget::popupAnimationStarted, t,
                     animation("popupAnimationStarted"));
    QObject::connect(t, &ViewStateTarget::popupStatusChanged, t,
                     [add](const Identifier &id, bool shown) {
                         add({"popupStatusChanged", id, shown ? "true" : "false"});
                     });
}

QStringList popupsIn(const PopupListModel *model)
{
    QStringList result;
    for (int row = 0; row < model->count(); ++row) {
        const PopupEntry entry = model->entry(row);
        result.append(entry.popupId + (entry.covered ? " (covered)" : ""));
    }
    return result;
}
