import QtQuick 2.15
import HeadUnit 1.0
import "../.."
import "../../controls"

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
                { name: "Ann", color: "#e86f8b" },
                { name: "Jonas", color: "#5b7cfa" },
                { name: "Office", color: "#f2a65a" }
            ]

            Column {
                width: 84
                spacing: 4

                Rectangle {
                    anchors.horizontalCenter: parent.horizontalCenter
                    width: 68
                    height: 68
                    radius: 34
                    color: Qt.darker(modelData.color, 1.9)
                    border { width: 2; color: modelData.color }

                    Label {
                        anchors.centerIn: parent
                        text: modelData.name.charAt(0)
                        font.weight: Font.DemiBold
                    }
                }
                Label {
                    anchors.horizontalCenter: parent.horizontalCenter
                    kind: Label.Small
                    text: modelData.name
                }
            }
        }
    }
}
