import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import "../.."
import "../../controls"

/** The phone, and what else the car knows. */
Page {
    id: root

    title: "Devices"
    subtitle: Vehicle.phoneConnected ? "1 device connected" : "No phone connected"

    Card {
        id: phone
        width: 520
        height: 464

        Rectangle {
            id: picture
            anchors { horizontalCenter: parent.horizontalCenter; top: parent.top; topMargin: 8 }
            width: 128
            height: 128
            radius: 64
            color: Vehicle.phoneConnected ? Theme.accentSoft : Theme.raised

            Icon {
                anchors.centerIn: parent
                name: "smartphone"
                size: 64
                color: Vehicle.phoneConnected ? Theme.accent : Theme.disabled
            }
        }
        Column {
            anchors { left: parent.left; right: parent.right; top: picture.bottom; topMargin: 20 }
            spacing: 4

            Label {
                objectName: "phone-name"
                width: parent.width
                horizontalAlignment: Text.AlignHCenter
                text: "Mara’s phone"
                font { pixelSize: 34; weight: Font.DemiBold }
            }
            Label {
                objectName: "phone-state"
                width: parent.width
                horizontalAlignment: Text.AlignHCenter
                kind: Label.Small
                color: Vehicle.phoneConnected ? Theme.positive : Theme.secondary
                text: Vehicle.phoneConnected ? "Connected" : "Connect it to call from the car"
            }
        }
        Row {
            anchors { horizontalCenter: parent.horizontalCenter; bottom: connect.top; bottomMargin: 26 }
            visible: Vehicle.phoneConnected
            spacing: 40

            Repeater {
                model: [["battery_5_bar", "82 %"], ["signal_cellular_alt", "Good"], ["music_note", "Music on"]]

                Row {
                    spacing: 8

                    Icon { name: modelData[0]; size: 28; color: Theme.secondary }
                    Label { text: modelData[1]; kind: Label.Small }
                }
            }
        }
        TouchButton {
            id: connect
            objectName: "button-connect"
            anchors { left: parent.left; right: parent.right; bottom: parent.bottom }
            kind: Vehicle.phoneConnected ? TouchButton.Normal : TouchButton.Primary
            icon: Vehicle.phoneConnected ? "bluetooth_disabled" : "bluetooth"
            text: Vehicle.phoneConnected ? "Disconnect" : "Connect"
            onClicked: Vehicle.phoneConnected = !Vehicle.phoneConnected
        }
    }
    Card {
        anchors { left: phone.right; leftMargin: 24; right: parent.right }
        height: 464
        padding: 12

        Label {
            x: 20
            y: 12
            kind: Label.Small
            muted: true
            text: "Known devices"
        }
        Column {
            anchors { left: parent.left; right: parent.right; top: parent.top; topMargin: 54 }

            Repeater {
                model: [
                    { name: "Jonas’ phone", detail: "Last seen yesterday", icon: "smartphone" },
                    { name: "Rear headphones", detail: "Switched off", icon: "headphones" },
                    { name: "Family tablet", detail: "Last seen in October", icon: "tablet" },
                    { name: "USB stick “Blues”", detail: "Plugged in, 412 tracks", icon: "usb" }
                ]

                ListRow {
                    width: parent.width
                    touchable: false
                    icon: modelData.icon
                    title: modelData.name
                    subtitle: modelData.detail
                    separator: index < 3
                }
            }
        }
    }
}
