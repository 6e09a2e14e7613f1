import QtQuick 2.15
import ".."
import "../controls"

/** The car listens. */
OverlayPopup {
    id: root

    icon: "mic"
    panelWidth: root.width - 2 * Theme.margin
    text: ""

    Column {
        anchors.left: parent.left
        anchors.right: waves.left
        anchors.rightMargin: Theme.margin
        anchors.verticalCenter: parent.verticalCenter
        spacing: 2

        Label {
            objectName: "popup-title"
            width: parent.width
            text: root.read("text", "I am listening")
            strong: true
        }

        Label {
            width: parent.width
            text: "“Navigate home”   “Call Ann”   “Play music”"
            kind: Label.Small
            muted: true
        }
    }

    VoiceWaves {
        id: waves

        anchors.right: parent.right
        anchors.rightMargin: Theme.gap
        anchors.verticalCenter: parent.verticalCenter
    }
}
