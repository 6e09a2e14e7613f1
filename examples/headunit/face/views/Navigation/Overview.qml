import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"

/** The whole way to the destination, before guidance starts. */
Page {
    id: root

    readonly property int eta: root.read(root.activationData, "eta", 0)
    readonly property string via: root.read(root.activationData, "via", "")
    readonly property bool planned: root.eta > 0

    title: "Route"
    subtitle: "to 14 Orchard Way"
    inset: false

    Column {
        anchors { left: parent.left; leftMargin: Theme.margin; top: parent.top; topMargin: 8 }
        width: 460
        spacing: Theme.gap

        Card {
            width: parent.width
            height: 340
            visible: root.planned

            Row {
                spacing: 14

                Text {
                    id: minutes
                    objectName: "eta"
                    text: root.eta
                    color: Theme.text
                    font { family: Theme.font; pixelSize: Theme.huge; weight: Font.DemiBold; letterSpacing: -2 }
                }
                Label { anchors.baseline: minutes.baseline; text: "min"; muted: true }
            }
            Column {
                anchors { left: parent.left; right: parent.right; bottom: parent.bottom }

                RouteFact { width: parent.width; icon: "alt_route"; name: "Via"; value: root.via === "" ? "the town" : root.via }
                RouteFact { width: parent.width; icon: "straighten"; name: "Distance"; value: (root.eta * 0.62).toFixed(1) + " km" }
                RouteFact {
                    width: parent.width
                    icon: "schedule"
                    name: "Arrival"
                    value: Qt.formatTime(new Date(Date.now() + root.eta * 60000), Preferences.clockFormat)
                }
            }
        }
        Card {
            width: parent.width
            height: 340
            visible: !root.planned

            Column {
                anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter }
                spacing: 24

                Icon { name: "route"; size: 72; color: Theme.accent }
                Label { text: "Planning the route …" }
                SearchingBar { width: parent.width; running: root.visible && !root.planned }
            }
        }
        TouchButton {
            objectName: "button-start"
            width: parent.width
            height: 92
            kind: TouchButton.Primary
            icon: "navigation"
            text: "Start guidance"
            onClicked: Requests.event("StartGuidance")
        }
    }
    MapPicture {
        anchors { right: parent.right; top: parent.top; bottom: parent.bottom; topMargin: -96 }
        width: 664
        night: Preferences.nightMap
        following: false
        routeShown: root.planned
        zoom: 0.47
        centre: Qt.point(1620, 690)
    }
}
