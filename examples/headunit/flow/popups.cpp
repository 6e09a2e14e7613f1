#include "popups.h"

#include "building.h"
#include "viewlayer.h"

#include <HmiStateMachine/popup/popupstate.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

struct Description
{
    const char *layer;
    const char *name; ///< module and popup: what rules and requests go by
    const char *viewId; ///< what the view layer goes by; null for the name
    PopupKind kind;
};

const Description popups[] = {
    {"Screens", "phone/call", "CallBanner", QuestionPopup},
    {"Screens", "phone/ended", nullptr, NotePopup},
    {"Screens", "phone/lost", nullptr, NotePopup},
    {"Screens", "media/lost", nullptr, NotePopup},
    {"Screens", "car/fuel", "FuelWarning", WarningPopup},
    {"Screens", "navigation/traffic", nullptr, WarningPopup},
    {"Screens", "system/update", nullptr, QuestionPopup},
    {"Alerts", "system/voice", nullptr, OverlayPopup},
    {"Alerts", "media/volume", nullptr, OverlayPopup},
    {"Alerts", "car/speed", nullptr, WarningPopup},
    {"Alerts", "car/parking", nullptr, WarningPopup},
    {"Alerts", "car/fault", "FaultScreen", WarningPopup},
};

void addPopup(const Description &description)
{
    auto *popup = new PopupState(description.name, layer(description.layer), description.kind);
    if (description.viewId) {
        popup->setPopupViewId(description.viewId);
    }
}

// What a popup tells of itself and the view layer is not told.
void tellOf(PopupState *popup, ViewLayer *viewLayer)
{
    QObject::connect(popup, &PopupState::blocked, viewLayer,
                     [popup, viewLayer] { viewLayer->noteRefusal(popup->popupViewId()); });
    QObject::connect(popup, &PopupState::popupTimeOut, viewLayer, [popup, viewLayer] {
        viewLayer->showStatus("time is up for " + popup->popupViewId());
    });
    QObject::connect(
        popup, &PopupState::exitingDueToDriverRestrictions, viewLayer,
        [popup, viewLayer] { viewLayer->showHint("not while driving: " + popup->popupViewId()); });
}

} // namespace

void addPopups(const Surroundings &surroundings)
{
    for (const Description &description : popups) {
        addPopup(description);
        tellOf(popup(description.name), surroundings.viewLayer);
    }
    addAdvertisement();
    tellOf(popup("navigation/advert"), surroundings.viewLayer);

    setTimeouts(surroundings.timing);
    keepFaultOpen();
    warnOfSpeed(surroundings);
    restrictToStanding(surroundings);
    keepBlockedPopups(surroundings);
}

} // namespace headunit
