#include "popupflow.h"

#include "driving.h"
#include "messagerecorder.h"
#include "viewflow.h"

#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

constexpr auto leaveEvent = QEvent::Type(QEvent::User + 1);
constexpr auto comeBackEvent = QEvent::Type(QEvent::User + 2);

} // namespace

PopupFlow::PopupFlow(MessageRecorder &messages)
    : m_messages(messages), work(new NamedState("Work", QState::ParallelStates, &machine)),
      away(new NamedState("Away", &machine)), lower(new PopupRootState("Lower", work)),
      upper(new PopupRootState("Upper", work))
{
    lead(leaveEvent, work, away);
    lead(comeBackEvent, away, work);
}

PopupFlow::~PopupFlow()
{
    const auto left = takeMessages();
    for (const QString &message : left) {
        QTest::qFail(qPrintable("Unexpected message: " + message), __FILE__, __LINE__);
    }
}

PopupState *PopupFlow::popup(const QString &name, const QString &viewId, int kind)
{
    auto *popup = new PopupState(name, lower, kind);
    popup->setPopupViewId(viewId);
    return popup;
}

PopupState *PopupFlow::upperPopup(const QString &name, const QString &viewId, int kind)
{
    auto *popup = new PopupState(name, upper, kind);
    popup->setPopupViewId(viewId);
    return popup;
}

void PopupFlow::record(PopupState *popup)
{
    const auto add = [this, popup](const char *signal) {
        return [this, popup, signal] { journal.add(popup->popupViewId() + ' ' + signal); };
    };
    QObject::connect(popup, &PopupState::popupTimeOut, popup, add("popupTimeOut"));
    QObject::connect(popup, &PopupState::aboutToBeActivated, popup, add("aboutToBeActivated"));
    QObject::connect(popup, &PopupState::alreadyActivated, popup, add("alreadyActivated"));
    QObject::connect(popup, &PopupState::blocked, popup, add("blocked"));
    QObject::connect(popup, &PopupState::exitingDueToDriverRestrictions, popup,
                     add("exitingDueToDriverRestrictions"));
    QObject::connect(popup, &PopupState::popupHidden, popup, add("popupHidden"));
    QObject::connect(popup, &PopupState::popupShown, popup, add("popupShown"));
}

void PopupFlow::start()
{
    startIn(machine, work);
    journal.clear();
}

void PopupFlow::request(const QString &name, const QVariant &data)
{
    machine.postEvent(new PopupEvent(name, data));
    settle();
}

void PopupFlow::requestAgain(const QString &name, const QVariant &data)
{
    machine.postEvent(new PopupEvent(name, true, data));
    settle();
}

void PopupFlow::leave()
{
    machine.postEvent(new QEvent(leaveEvent));
    settle();
}

void PopupFlow::comeBack()
{
    machine.postEvent(new QEvent(comeBackEvent));
    settle();
}

QStringList PopupFlow::take()
{
    const QStringList lines = journal.lines();
    journal.clear();
    return lines;
}

QStringList PopupFlow::takeMessages()
{
    QStringList result;
    const auto messages = m_messages.takeMessages();
    for (const Message &message : messages) {
        if (message.type != QtWarningMsg || message.function != "showPopup") {
            result.append(message.toString());
        }
    }
    return result;
}

void PopupFlow::rule(const QString &front, PopupState::InterruptionBehavior answer,
                     const QString &requested)
{
    PopupInterruptionStore::instance()->insertInterruptionBehavior(answer, front, requested);
}

void PopupFlow::load(const QByteArray &json)
{
    QTemporaryFile file;
    QVERIFY(file.open());
    QCOMPARE(file.write(json), qint64(json.size()));
    QVERIFY(file.flush());
    PopupInterruptionStore::instance()->loadInterruptionBehaviors(file.fileName());
}
