#include "randomevents.h"

#include "flow/voice.h"
#include "hardkeys.h"
#include "scenario/vocabulary.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QCoreApplication>
#include <QTimer>
#include <QTimerEvent>
#include <QVariantMap>

using namespace HmiStateMachine;
using namespace headunit;

namespace {

const QStringList &applicationEvents()
{
    static const QStringList names{
        "SelectSource",     "SourceReady",   "Confirm",      "TrackChanged",      "ShowVideo",
        "IncomingCall",     "CallEnded",     "Dial",         "SearchDestination", "ResultsFound",
        "RouteReady",       "StartGuidance", "StopGuidance", "TrafficAlert",      "Dismiss",
        "AnnouncementDone", "StartUpdate",   "UpdateDone",   "FaultRepaired",     "DisplayOff",
        "LanguageChosen"};
    return names;
}

// All timers are made with the flow; a popup's is made when it first needs one.
QVector<QTimer *> timersOf(const QStateMachine *machine)
{
    return machine->findChildren<QTimer *>().toVector();
}

} // namespace

RandomEvents::RandomEvents(quint32 seed, const Stage &stage)
    : m_random(seed), m_stage(stage), m_views(requestableNames()), m_viewStates(viewStateNames()),
      m_popups(popupNames()), m_domains(ViewLayer::domainNames()), m_phrases(voicePhrases()),
      m_timers(timersOf(StateMachine::instance()))
{
    const auto add = [this](int weight, Deed deed) { m_deeds += QVector<Deed>(weight, deed); };
    add(20, &RandomEvents::requestView);
    add(14, &RandomEvents::pressBack);
    add(10, &RandomEvents::pressKey);
    add(12, &RandomEvents::requestPopup);
    add(4, &RandomEvents::refreshPopup);
    add(10, &RandomEvents::dismissPopup);
    add(8, &RandomEvents::letTimerRunOut);
    add(3, &RandomEvents::changeDomain);
    add(6, &RandomEvents::changeProperty);
    add(4, &RandomEvents::drive);
    add(16, &RandomEvents::raiseEvent);
    add(3, &RandomEvents::speak);
    add(1, &RandomEvents::askForTheUnknown);
}

void RandomEvents::next()
{
    ++m_count;
    (this->*m_deeds.at(m_random.below(m_deeds.size())))();
    QCoreApplication::sendPostedEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    m_stage.viewLayer->takeVoiceRequest();
}

void RandomEvents::requestView()
{
    StateMachine::instance()->postEvent(new HmiViewEvent(anyOf(m_views), newData()));
}

void RandomEvents::pressBack()
{
    const auto depth = static_cast<unsigned char>(m_random.oneIn(4) ? m_random.below(6) : 1);
    const QString target = m_random.oneIn(8) ? anyOf(m_viewStates) : QString();
    StateMachine::instance()->postEvent(new HmiBackEvent(depth, target));
}

void RandomEvents::pressKey()
{
    const int key = HardKeys::fromName(anyOf(keyNames()));
    Q_EMIT m_stage.keys->keyChanged(key, m_random.below(HardKeys::Held + 1));
}

void RandomEvents::requestPopup()
{
    StateMachine::instance()->postEvent(new PopupEvent(anyOf(m_popups), newData()));
}

// Asked for again, a popup that is shown takes the new data.
void RandomEvents::refreshPopup()
{
    const PopupState *front = PopupState::stateForTarget(m_stage.viewLayer->popupInFront());
    if (front) {
        StateMachine::instance()->postEvent(new PopupEvent(front->name(), newData()));
    }
}

void RandomEvents::dismissPopup()
{
    const QString target = m_random.oneIn(3)
        ? PopupDismissTransition::dismissEventWildCard
        : anyOf(m_popups) + PopupDismissTransition::dismissEventSigniture;
    StateMachine::instance()->postEvent(new PopupEvent(target, QVariant()));
}

void RandomEvents::letTimerRunOut()
{
    QVector<QTimer *> running;
    for (QTimer *timer : qAsConst(m_timers)) {
        if (timer->isActive()) {
            running.append(timer);
        }
    }
    if (running.isEmpty()) {
        return;
    }
    QTimer *timer = running.at(m_random.below(running.size()));
    QTimerEvent event(timer->timerId());
    QCoreApplication::sendEvent(timer, &event);
}

void RandomEvents::changeDomain()
{
    m_stage.viewLayer->setActiveDomain(anyOf(m_domains));
}

void RandomEvents::changeProperty()
{
    static const QStringList gears{"P", "R", "N", "D"};
    switch (m_random.below(4)) {
    case 0:
        return m_stage.vehicle->setGear(anyOf(gears));
    case 1:
        return m_stage.vehicle->setFuel(m_random.below(101));
    case 2:
        return m_stage.vehicle->setPhoneConnected(m_random.oneIn(2));
    default:
        return m_stage.vehicle->setReady(!m_random.oneIn(4));
    }
}

// At rest every other time, so that restricted popups come and go.
void RandomEvents::drive()
{
    m_stage.vehicle->setSpeed(m_random.oneIn(2) ? 0 : m_random.below(301));
}

void RandomEvents::raiseEvent()
{
    const QVariant said = m_random.oneIn(2) ? newData() : QVariant(QStringLiteral("wheel"));
    StateMachine::instance()->postEvent(new HmiEvent(anyOf(applicationEvents()), said));
}

void RandomEvents::speak()
{
    StateMachine::instance()->postEvent(new HmiEvent(voiceEvent(anyOf(m_phrases)), newData()));
}

void RandomEvents::askForTheUnknown()
{
    const QString name = QStringLiteral("nowhere %1").arg(m_count);
    StateMachine::instance()->postEvent(new HmiViewEvent(name, newData()));
    StateMachine::instance()->postEvent(new PopupEvent(name, newData()));
}

const QString &RandomEvents::anyOf(const QStringList &list)
{
    return list.at(m_random.below(list.size()));
}

// Different each time: what is kept of it shows as growth.
QVariant RandomEvents::newData()
{
    return QVariantMap{{"number", m_count}, {"text", QStringLiteral("text %1").arg(m_count)}};
}
