import QtQuick 2.15
import HmiStateMachine 1.0

/** Offers new software; the settings install it. */
QuestionPopup {
    id: root

    icon: "system_update"
    title: "Software " + root.read("version", "update") + " is ready"
    text: "It takes about 12 minutes. The car has to stay parked."
    yes: "Open settings"
    no: "Later"
    onAccepted: Requests.view("Settings/Main")
}
