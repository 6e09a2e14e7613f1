import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"
import "chosen.js" as Chosen

/** A call that is going on. */
Page {
    id: root

    readonly property var sent: root.read(root.viewData, "eventData", undefined)
    readonly property string told: root.read(root.activationData, "caller", root.read(root.sent, "caller", ""))
    readonly property var caller: book.caller(root.told || Chosen.caller || Chosen.name)

    title: "Call"

    property var began: Date.now()
    property int seconds: 0

    // The screen may be kept from the last call.
    onViewDataChanged: {
        root.began = Date.now()
        root.seconds = 0
    }

    ContactBook { id: book }

    Timer {
        interval: 250
        repeat: true
        running: root.visible
        onTriggered: root.seconds = (Date.now() - root.began) / 1000
    }

    Row {
        y: 8
        spacing: 36

        Avatar {
            width: 164
            name: root.caller.name
            tint: root.caller.tint
        }
        Column {
            anchors.verticalCenter: parent.verticalCenter
            spacing: 6

            Label {
                objectName: "caller"
                width: 760
                text: root.caller.name
                font { pixelSize: 56; weight: Font.DemiBold; letterSpacing: -1 }
            }
            Label {
                visible: root.caller.mobile !== ""
                muted: true
                text: "Mobile " + root.caller.mobile
            }
            Row {
                spacing: 14

                Icon { name: "phone_in_talk"; size: 34; color: Theme.positive; anchors.verticalCenter: parent.verticalCenter }
                Label {
                    objectName: "duration"
                    text: Math.floor(root.seconds / 60) + ":" + String(root.seconds % 60).padStart(2, "0")
                    color: Theme.positive
                    font { pixelSize: 34; weight: Font.Medium }
                }
            }
        }
    }
    Row {
        y: 206
        spacing: Theme.gap

        CallToggle { objectName: "button-mute"; icon: on ? "mic_off" : "mic"; text: on ? "Muted" : "Mute" }
        CallToggle { objectName: "button-hold"; icon: on ? "play_arrow" : "pause"; text: on ? "On hold" : "Hold" }
        CallToggle { objectName: "button-private"; icon: "smartphone"; text: on ? "On the phone" : "To the phone" }
        CallToggle { objectName: "button-noise"; icon: "noise_aware"; text: "Less noise"; on: true }
    }
    TouchButton {
        objectName: "button-hang-up"
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; bottomMargin: 8 }
        height: 96
        round: true
        kind: TouchButton.Critical
        icon: "call_end"
        iconSize: 42
        text: "Hang up"
        onClicked: Requests.event("CallEnded")
    }
}
