import QtQuick 2.15
import "../.."
import "../../controls"

/** A number to be called by touching it. */
Card {
    id: root

    property string icon
    property string kind
    property string number

    height: 128
    padding: 0
    touchable: root.enabled

    Icon {
        anchors { left: parent.left; leftMargin: 28; verticalCenter: parent.verticalCenter }
        name: root.icon
        size: 40
        color: Theme.secondary
    }
    Column {
        anchors { left: parent.left; leftMargin: 96; verticalCenter: parent.verticalCenter }
        spacing: 2

        Label { text: root.kind; kind: Label.Small; muted: true }
        Label {
            text: root.number
            color: root.enabled ? Theme.text : Theme.disabled
            font { pixelSize: 34; weight: Font.Medium }
        }
    }
    Rectangle {
        anchors { right: parent.right; rightMargin: 24; verticalCenter: parent.verticalCenter }
        width: 80
        height: 80
        radius: 40
        color: root.enabled ? Theme.positive : Theme.raised

        Icon {
            anchors.centerIn: parent
            name: "call"
            size: 38
            color: root.enabled ? Theme.accentText : Theme.disabled
        }
    }
}
