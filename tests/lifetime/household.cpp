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

} // namespace

Household::Household(quint32 seed, bool processWide) : m_random(seed)
{
    if (processWide) {
        m_machine = StateMachine::instance();
    } else {
        m_ownMachine = std::make_unique<QStateMachine>();
        m_machine = m_ownMachine.get();
    }
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
    build();
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
    const bool goesWhileItRuns = m_ownMachine && m_random.oneIn(3);
    QVector<void (Household::*)()> ends{&Household::removeTree};
    for (const Deed end : {&Household::endSender, &Household::endGroup, &Household::endFilters,
                           &Household::endMonitor}) {
        ends += QVector<Deed>(senderCount, end);
    }
    for (int i = ends.size() - 1; i > 0; --i) {
        std::swap(ends[i], ends[m_random.below(i + 1)]);
    }
    if (m_random.oneIn(2)) {
        m_target.reset();
    }
    for (const Deed end : qAsConst(ends)) {
        if (goesWhileItRuns && end == static_cast<Deed>(&Household::removeTree)) {
            m_ownMachine.reset();
        } else if (m_machine || end != static_cast<Deed>(&Household::removeTree)) {
            (this->*end)();
        }
    }
    PopupState::setStoreBlockedPopups(false);
    PopupState::setDriverRestrictionProperty(nullptr, QByteArray(), QVariant());
    settleAll();
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

// Parked, a machine points at none of the states, which may then go one by one.
void Household::removeTree()
{
    park(*m_machine);
    QVector<QPointer<QObject>> all;
    const auto objects = m_house->findChildren<QObject *>();
    for (QObject *object : objects) {
        if (qobject_cast<HmiViewState *>(object) || qobject_cast<QAbstractTransition *>(object)
            || qobject_cast<PopupState *>(object) || qobject_cast<PopupRootState *>(object)
            || qobject_cast<HmiLayeredState *>(object)) {
            all.append(object);
        }
    }
    for (int i = all.size() - 1; i > 0; --i) {
        std::swap(all[i], all[m_random.below(i + 1)]);
    }
    const int singly = m_random.below(all.size() + 1);
    for (int i = 0; i < singly; ++i) {
        if (!all.at(i)) {
            continue;
        }
        // These are the library's own; only whoever is asked for them hands them out.
        const bool own = qobject_cast<QAbstractTransition *>(all.at(i))
            && !m_transitions.contains(qobject_cast<QAbstractTransition *>(all.at(i)));
        if (!own) {
            delete all.at(i);
        }
    }
    delete m_house;
}
