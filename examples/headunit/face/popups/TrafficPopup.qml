import QtQuick 2.15
import HmiStateMachine 1.0

/** There is a jam on the route. */
WarningPopup {
    id: root

    readonly property int minutes: Number(root.read("minutes", 0))

    icon: "traffic"
    title: root.minutes > 0 ? "Traffic jam, " + root.minutes + " min" : "Traffic jam ahead"
    text: root.read("road", "On your route") + ": slow traffic for the next 3 km"
    yes: "Show on map"
    no: "Ignore"
    onAccepted: Requests.view("Navigation/Traffic")
}
