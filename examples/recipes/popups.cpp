// Popups that give way to the driver's attention, and popups that wait for a domain.

#include "printing.h"
#include "recipes.h"
#include "vehicle.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/domainblockedpopupstate.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>

using namespace HmiStateMachine;

void driverRestriction()
{
    PrintingViewLayer viewLayer;
    Vehicle vehicle;
    PopupState::setDriverRestrictionProperty(&vehicle, "moving", true);
    auto *screens = new HmiLayeredState("Screens", StateMachine::instance());
    new PopupState("phone/call", screens, 0);
    auto *keyboard = new PopupState("input/keyboard", screens, 0);
    keyboard->setDriverRestricted(true); // after the property has been named
    QObject::connect(keyboard, &PopupState::exitingDueToDriverRestrictions, keyboard,
                     [] { say("  not while driving"); });
    startIn(screens);

    request("The keyboard.", new PopupEvent("input/keyboard", QVariant()));
    say("The car moves.");
    vehicle.setProperty("moving", true);
    QCoreApplication::sendPostedEvents();
    request("The keyboard, while it moves.", new PopupEvent("input/keyboard", QVariant()));

    vehicle.setProperty("moving", false);
    request("The car stands. A call interrupts.", new PopupEvent("phone/call", QVariant()));
    vehicle.setProperty("moving", true);
    request("The car moves, and the call ends.", new PopupEvent("phone/call_Dismiss", QVariant()));
}

namespace {

// A view layer that knows domains.
class DomainViewLayer : public PrintingViewLayer
{
public:
    int domainFromName(const QString &name) override { return name == "Camera" ? Camera : Other; }
    int activeDomain() const override { return m_activeDomain; }

    void setActiveDomain(int domain)
    {
        const int old = m_activeDomain;
        m_activeDomain = domain;
        Q_EMIT activeDomainChanged(domain, old);
    }

    void retryBlockedPopup(PopupState *popup) override
    {
        StateMachine::instance()->postEvent(new PopupEvent(popup->name(), QVariant()));
    }

    enum Domain { Other, Camera };

private:
    int m_activeDomain = Other;
};

} // namespace

void domains()
{
    DomainViewLayer viewLayer; // before the rules: it is asked for the numbers of domains
    PopupInterruptionStore::instance()->loadInterruptionBehaviors(RULES_FILE);
    auto *screens = new HmiLayeredState("Screens", StateMachine::instance());
    new PopupState("media/note", screens, 0);
    new DomainBlockedPopupState("phone/message", screens, 0);
    startIn(screens);

    viewLayer.setActiveDomain(DomainViewLayer::Camera);
    request("A note, over the camera.", new PopupEvent("media/note", "Now: Bay Jazz"));
    request("A message, over the camera.", new PopupEvent("phone/message", "See you at six"));
    say("The camera goes.");
    viewLayer.setActiveDomain(DomainViewLayer::Other);
    QCoreApplication::sendPostedEvents();
    say("The camera comes back.");
    viewLayer.setActiveDomain(DomainViewLayer::Camera);
    say("The camera goes.");
    viewLayer.setActiveDomain(DomainViewLayer::Other);
}
