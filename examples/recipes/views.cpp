// Where back leads, views that may not be shown, and what a view is given.

#include "printing.h"
#include "recipes.h"
#include "vehicle.h"

#include <HmiStateMachine/hmi/hmimodulewhitelistfilter.h>
#include <HmiStateMachine/hmi/hmipropertyboundfallbackviewstate.h>
#include <HmiStateMachine/hmi/hmitargetblacklistfilter.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>

using namespace HmiStateMachine;

void backFilters()
{
    PrintingViewLayer viewLayer;
    StateMachine *machine = StateMachine::instance();
    auto *home = new HmiViewState("Home", machine);
    (new HmiViewState("Media/Login", machine))->setHandlesBackEvent(true);

    auto *player = new HmiViewState("Media/Player", machine);
    player->setHandlesBackEvent(true);
    player->addBackTargetFilter(QSharedPointer<HmiTargetBlacklistFilter>::create("Media/Login"));

    auto *contact = new HmiViewState("Phone/Contact", machine);
    contact->setHandlesBackEvent(true);
    contact->addBackTargetFilter(QSharedPointer<HmiModuleWhitelistFilter>::create("Phone/"));
    startIn(home);

    request("The login.", new HmiViewEvent("Media/Login", QVariant()));
    request("Then the player.", new HmiViewEvent("Media/Player", QVariant()));
    say("Back leads to " + player->backTarget());
    request("To a contact of the phone.", new HmiViewEvent("Phone/Contact", QVariant()));
    say("Back leads to \"" + contact->backTarget() + "\"");
    request("Back.", new HmiBackEvent(1, QString()));
}

namespace {

// Asks something else than a property.
class UpdateView : public HmiFallbackViewState
{
public:
    explicit UpdateView(QState *parent) : HmiFallbackViewState("Update", "Home", parent) { }

    bool permitted() override { return m_permitted; }
    void setPermitted(bool permitted)
    {
        m_permitted = permitted;
        reevaluate();
    }

private:
    bool m_permitted = true;
};

} // namespace

void fallbacks()
{
    PrintingViewLayer viewLayer;
    Vehicle vehicle;
    StateMachine *machine = StateMachine::instance();
    auto *home = new HmiViewState("Home", machine);
    new HmiViewState("Pairing", machine); // before the view that names it
    new HmiPropertyBoundFallbackViewState("Phone", "Pairing", &vehicle, "phoneConnected", {true},
                                          machine, true);
    auto *update = new UpdateView(machine);
    startIn(home);

    request("The phone, while none is connected.", new HmiViewEvent("Phone", QVariant()));
    vehicle.setProperty("phoneConnected", true);
    request("The phone, now that there is one.", new HmiViewEvent("Phone", QVariant()));
    say("It is switched off.");
    vehicle.setProperty("phoneConnected", false);
    QCoreApplication::sendPostedEvents();

    request("The update.", new HmiViewEvent("Update", QVariant()));
    say("It is called off.");
    update->setPermitted(false);
    QCoreApplication::sendPostedEvents();
}

void dataAndRefresh()
{
    PrintingViewLayer viewLayer;
    QObject::connect(&viewLayer, &ViewStateTarget::activeViewDataChanged, &viewLayer,
                     [](const QVariant &data) {
                         say("  refresh: " + (data.isValid() ? data.toString() : "nothing"));
                     });
    StateMachine *machine = StateMachine::instance();
    auto *home = new HmiViewState("Home", machine);
    auto *radio = new HmiViewState("Radio", machine);
    radio->addInstanceData("band", "FM"); // beside "eventData" and "entryReason", at every entry
    startIn(home);

    radio->setActivationData("Bay Jazz"); // not active: kept for its entry
    request("The radio.", new HmiViewEvent("Radio", "from the list"));
    say("Another station.");
    radio->setActivationData("City News");
    say("The same station.");
    radio->setActivationData("City News");
}
