import QtQuick 2.15
import HeadUnit 1.0
import "../.."
import "../../controls"
import "../Phone" as Phone

/** The telephone, and who is called most with it. */
Card {
    id: root

    padding: 20
    touchable: true

    Row {
        id: heading
        spacing: 14

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            name: Vehicle.phoneConnected ? "phone" : "phone_disabled"
            color: Vehicle.phoneConnected ? Theme.positive : Theme.secondary
        }
        Label {
            anchors.verticalCenter: parent.verticalCenter
            text: "Phone"
            font.weight: Font.Medium
        }
    }
    Label {
        anchors { right: parent.right; verticalCenter: heading.verticalCenter }
        kind: Label.Small
        muted: true
        text: Vehicle.phoneConnected ? "1 missed call" : "Not connected"
    }
    Label {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; bottomMargin: 20 }
        visible: !Vehicle.phoneConnected
        kind: Label.Small
        muted: true
        wrapMode: Text.WordWrap
        text: "Connect a phone to call your favourites from here."
    }
    Row {
        anchors { bottom: parent.bottom; horizontalCenter: parent.horizontalCenter }
        visible: Vehicle.phoneConnected
        spacing: 32

        Repeater {
            model: [
                { name: "Ann Marlow", tint: "#3d7ea6" },
                { name: "Ben Tarrow", tint: "#8a6a3f" },
                { name: "Jonas Averill", tint: "#6f8a45" }
            ]

            Column {
                width: 84
                spacing: 4

                Phone.Avatar {
                    anchors.horizontalCenter: parent.horizontalCenter
                    width: 68
                    name: modelData.name
                    tint: modelData.tint
                }
                Label {
                    anchors.horizontalCenter: parent.horizontalCenter
                    kind: Label.Small
                    text: modelData.name.split(" ")[0]
                }
            }
        }
    }
}
