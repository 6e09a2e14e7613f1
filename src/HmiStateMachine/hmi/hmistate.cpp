#include <HmiStateMachine/hmi/hmistate.h>

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/internal/exclusivelayer.h>
#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/internal/viewlayer.h>
#include <HmiStateMachine/named/viewstatetarget.h>

namespace HmiStateMachine {

namespace {

constexpr char screenEntryMarker[] = "P12.R041.02 - Screen Entry: Start Marker";

}

HmiState::HmiState(const QString &name, QState *parent) : NamedState(name, nullptr)
{
    QState *layer = exclusiveLayerOf(parent);
    setParent(layer);
    // From the layer, not the layered state: an explicit setting cuts the connection to the parent.
    inheritPopupBehavior(layer);
}

HmiState::HmiState(QState *parent) : NamedState(parent)
{
    inheritPopupBehavior(parent);
}

HmiState::~HmiState() = default;

HmiState *HmiState::createWithoutHashing(const QString &name, QState *parent)
{
    auto *state = new HmiState(parent);
    state->setNameNonHashing(name);
    return state;
}

HmiState::PopupBehavior HmiState::popupBehavior() const
{
    return m_popupBehavior;
}

void HmiState::addHmiTransition(QAbstractTransition *t)
{
    addTransition(t);
    if (auto *signalTransition = qobject_cast<HmiSignalTransition *>(t)) {
        signalTransition->sourceStateChange(this);
    }
}

void HmiState::setPopupBehavior(PopupBehavior behavior)
{
    if (behavior == m_popupBehavior) {
        return;
    }
    m_popupBehavior = behavior;
    Q_EMIT popupBehaviorChanged(behavior);
    if (auto *parent = qobject_cast<HmiState *>(parentState())) {
        disconnect(parent, &HmiState::popupBehaviorChanged, this, &HmiState::syncPopupBehavior);
    }
}

void HmiState::syncPopupBehavior(PopupBehavior behavior)
{
    if (behavior == m_popupBehavior) {
        return;
    }
    m_popupBehavior = behavior;
    Q_EMIT popupBehaviorChanged(behavior);
}

void HmiState::onEntry(QEvent *event)
{
    // Before the base's work: the marker is the start of a time measurement.
    HMI_DEBUG(hmiperformance()) << screenEntryMarker;
    HMI_DEBUG(hmitrace()) << screenEntryMarker;
    NamedState::onEntry(event);
    ViewStateTarget *target = viewLayer();
    if (!target) {
        return;
    }
    switch (m_popupBehavior) {
    case DefaultPopupBehavior:
        target->resetScreenPopupBehavior();
        break;
    case PopupBehaviorOff:
        target->setScreenPopupBehavior(false);
        break;
    case PopupBehaviorOn:
        target->setScreenPopupBehavior(true);
        break;
    }
}

void HmiState::onExit(QEvent *event)
{
    NamedState::onExit(event);
}

void HmiState::setInitialHmiState(QState *state)
{
    NamedState::setInitialState(state);
}

QAbstractState *HmiState::initialHmiState() const
{
    return initialState();
}

void HmiState::inheritPopupBehavior(QState *parent)
{
    auto *hmiParent = qobject_cast<HmiState *>(parent);
    if (!hmiParent) {
        return;
    }
    // Not as an explicit setting, which would look through all connections of the parent for the
    // one to this state, that is only made here.
    syncPopupBehavior(hmiParent->popupBehavior());
    connect(hmiParent, &HmiState::popupBehaviorChanged, this, &HmiState::syncPopupBehavior);
}

} // namespace HmiStateMachine
