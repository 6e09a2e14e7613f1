#include "household.h"

#include "driving.h"
#include "interruptions.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QCoreApplication>

#include <algorithm>

using namespace HmiStateMachine;

namespace {

constexpr int layerCount = 2;
constexpr int viewCount = 6;
constexpr int popupCount = 6;
constexpr int transitionCount = 16;
constexpr int senderCount = 3;

// Kept as long as the process lives; a view layer has to be there, to number the domain.
void loadRulesOnce()
{
    static const bool loaded =
        loadInterruptions(*PopupInterruptionStore::instance(),
                          R"([{"popup": "popup/*", "domainBlacklist": ["one"]}])");
    Q_ASSERT(loaded);
    Q_UNUSED(loaded)
}

// Made by the application, or handed out to it: not what a layered state has inside.
bool isMade(const NamedState *state)
{
    return qobject_cast<const HmiViewState *>(state) || qobject_cast<const PopupState *>(state)
        || qobject_cast<const PopupRootState *>(state)
        || qobject_cast<const HmiLayeredState *>(state);
}

} // namespace

Household::Household(quint32 seed, bool processWide) : m_random(seed)
{
    if (processWide) {
        m_machine = StateMachine::instance();
    } else {
        m_ownMachine = std::make_unique<QStateMachine>();
        m_machine = m_ownMachine.get();
    }
    chooseDeeds();
    build();
}

void Household::chooseDeeds()
{
    const auto add = [this](int weight, Deed deed) { m_deeds += QVector<Deed>(weight, deed); };
    for (const Deed deed :
         {&Household::requestView, &Household::pressBack, &Household::requestPopup,
          &Household::dismissPopup, &Household::raiseEvent, &Household::emitSignal,
          &Household::runTimerOut}) {
        add(8, deed);
    }
    for (const Deed deed : {&Household::changeSettings, &Household::addView, &Household::addPopup,
                            &Household::addToGroup, &Household::addFilter, &Household::addMonitor,
                            &Household::endView, &Household::endPopup}) {
        add(3, deed);
    }
    add(6, &Household::addTransition);
    add(4, &Household::endTransition);
    for (const Deed deed : {&Household::endSender, &Household::endGroup, &Household::endFilters,
                            &Household::endMonitor, &Household::replaceViewLayer,
                            &Household::renameSomething, &Household::startAnew}) {
        add(1, deed);
    }
}

Household::~Household()
{
    takeDown();
}

void Household::step()
{
    (this->*m_deeds.at(m_random.below(m_deeds.size())))();
    if (!m_random.oneIn(4)) { // else what follows meets what is posted
        settleAll();
    }
}

void Household::build()
{
    m_target = std::make_unique<RecordingViewStateTarget>(m_journal);
    for (int i = 0; i < senderCount; ++i) {
        m_senders.append(new Emitter);
    }
    m_target->setDomains({{QStringLiteral("one"), 1}});
    loadRulesOnce();
    m_house = new NamedState(newName(QStringLiteral("house")), QState::ParallelStates, m_machine);
    for (int i = 0; i < layerCount; ++i) {
        addLayer();
    }
    for (int i = 0; i < viewCount; ++i) {
        addView();
    }
    for (int i = 0; i < popupCount; ++i) {
        addPopup();
    }
    for (int i = 0; i < transitionCount; ++i) {
        addTransition();
    }
    startIn(*m_machine, m_house);
}

// Each layer has one view that stays, so that there is somewhere to begin.
void Household::addLayer()
{
    auto *layer = new HmiLayeredState(newName(QStringLiteral("layer")), m_house);
    layer->setInitialHmiState(new HmiViewState(newName(QStringLiteral("first")), layer));
    m_layers.append(layer);
}

void Household::settleAll()
{
    settle();
    for (const QString &line : m_journal.lines()) {
        ++m_calls[line.section(' ', 0, 0)];
    }
    m_journal.clear();
}

QString Household::newName(const QString &kind)
{
    return QStringLiteral("%1/%2").arg(kind).arg(++m_count);
}

void Household::takeDown()
{
    if (!m_machine) {
        return;
    }
    if (m_random.oneIn(2)) {
        m_target.reset();
    }
    QVector<Deed> ends{m_ownMachine && m_random.oneIn(3) ? &Household::removeMachine
                                                         : &Household::removeTree};
    for (const Deed end : {&Household::endSender, &Household::endGroup, &Household::endFilters,
                           &Household::endMonitor}) {
        ends += QVector<Deed>(senderCount, end);
    }
    shuffle(ends);
    for (const Deed end : qAsConst(ends)) {
        (this->*end)();
    }
    PopupState::setStoreBlockedPopups(false);
    PopupState::setDriverRestrictionProperty(nullptr, QByteArray(), QVariant());
    settleAll();
    removeTheRest();
}

void Household::removeTheRest()
{
    for (const auto &sender : qAsConst(m_senders)) {
        delete sender;
    }
    for (const auto &group : qAsConst(m_groups)) {
        delete group;
    }
    m_ownMachine.reset();
    m_target.reset();
    m_machine = nullptr;
}

// While it runs, with all its states.
void Household::removeMachine()
{
    m_ownMachine.reset();
}

// Parked, a machine points at none of the states, which may then go one by one: as many as the lot
// says, and the others with what they belong to.
void Household::removeTree()
{
    park(*m_machine);
    QVector<QPointer<QObject>> parts;
    const auto states = m_house->findChildren<NamedState *>();
    for (NamedState *state : states) {
        if (isMade(state)) {
            parts.append(state);
        }
    }
    for (const auto &transition : qAsConst(m_transitions)) {
        parts.append(transition.data());
    }
    shuffle(parts);
    parts.resize(m_random.below(parts.size() + 1));
    for (const auto &part : qAsConst(parts)) {
        delete part;
    }
    delete m_house;
}
