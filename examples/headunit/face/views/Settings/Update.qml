import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"

/** The car gets new software. There is no way out of here but the end of it. */
Page {
    id: root

    readonly property var phases: ["Checking the car", "Copying the software", "Setting up", "Almost ready"]
    property real progress: 0

    NumberAnimation {
        target: root
        property: "progress"
        running: root.visible // anew for every update, also when the screen is kept
        from: 0.04
        to: 0.98
        duration: 60000
        easing.type: Easing.OutCubic
    }

    ProgressRing {
        id: ring
        anchors { left: parent.left; leftMargin: 112; verticalCenter: parent.verticalCenter }
        width: 336
        height: 336
        value: root.progress
        groove: Theme.raised
        colour: Theme.accent

        Column {
            anchors.centerIn: parent

            Label {
                objectName: "progress"
                anchors.horizontalCenter: parent.horizontalCenter
                text: Math.round(root.progress * 100)
                font { pixelSize: 92; weight: Font.DemiBold; letterSpacing: -3 }
            }
            Label { anchors.horizontalCenter: parent.horizontalCenter; text: "per cent"; kind: Label.Small; muted: true }
        }
    }
    Column {
        anchors { left: ring.right; leftMargin: 88; right: parent.right; rightMargin: 64; verticalCenter: parent.verticalCenter }
        spacing: 18

        Label { objectName: "title"; text: "Updating to version 4.2"; kind: Label.Title }
        Label {
            width: parent.width
            muted: true
            wrapMode: Text.WordWrap
            elide: Text.ElideNone
            text: "Please leave the car in P and do not switch it off. This screen closes when the update is done."
        }
        Item { width: 1; height: 6 }
        Repeater {
            model: root.phases

            UpdatePhase {
                text: modelData
                begun: root.progress >= index * 0.27
                done: root.progress >= (index + 1) * 0.27
            }
        }
    }
}
