import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"
import "chosen.js" as Chosen

/** Somebody calls, and the driver decides. */
Page {
    id: root

    readonly property string told: root.read(root.activationData, "caller", "")
    readonly property var caller: book.caller(root.told === "" ? "Unknown caller" : root.told)

    title: "Incoming call"
    onCallerChanged: Chosen.caller = root.caller.name

    ContactBook { id: book }

    Ripples {
        anchors.centerIn: avatar
        tint: root.caller.tint
        running: root.visible
    }
    Avatar {
        id: avatar
        anchors.horizontalCenter: parent.horizontalCenter
        y: 16
        width: 160
        name: root.caller.name
        tint: root.caller.tint
    }
    Column {
        anchors { horizontalCenter: parent.horizontalCenter; top: avatar.bottom; topMargin: 40 }
        width: 900
        spacing: 4

        Label {
            objectName: "caller"
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            text: root.caller.name
            font { pixelSize: 56; weight: Font.DemiBold; letterSpacing: -1 }
        }
        Label {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            muted: true
            text: root.caller.mobile !== "" ? "Mobile " + root.caller.mobile : "Number unknown"
        }
    }
    Row {
        anchors { horizontalCenter: parent.horizontalCenter; bottom: parent.bottom; bottomMargin: 12 }
        spacing: 32

        TouchButton {
            objectName: "button-decline"
            width: 320
            height: 104
            round: true
            kind: TouchButton.Critical
            icon: "call_end"
            iconSize: 42
            text: "Decline"
            onClicked: Requests.event("CallEnded")
        }
        TouchButton {
            objectName: "button-accept"
            width: 320
            height: 104
            round: true
            kind: TouchButton.Positive
            icon: "call"
            iconSize: 42
            text: "Accept"
            onClicked: Requests.event("Confirm", "touch")
        }
    }
}
