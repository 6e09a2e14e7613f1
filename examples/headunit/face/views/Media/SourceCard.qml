import QtQuick 2.15
import "../.."
import "../../controls"

/** Something that music can come from. */
Card {
    id: root

    property string icon
    property string title
    property string subtitle
    property color tint: Theme.accent
    property bool connecting: false
    property bool active: false

    touchable: true
    border.width: root.active ? 2 : 1
    border.color: root.active ? Theme.accent : Theme.raised

    Rectangle {
        width: 88
        height: 88
        radius: 28
        color: Qt.rgba(root.tint.r, root.tint.g, root.tint.b, 0.18)

        Icon {
            id: picture

            anchors.centerIn: parent
            name: root.connecting ? "autorenew" : root.icon
            size: 48
            color: root.enabled ? root.tint : Theme.disabled

            RotationAnimation on rotation {
                running: root.connecting
                loops: Animation.Infinite
                from: 0
                to: 360
                duration: 1200
                onStopped: picture.rotation = 0
            }
        }
    }
    Icon {
        anchors { right: parent.right; top: parent.top }
        visible: root.active && !root.connecting
        name: "graphic_eq"
        size: 40
        color: Theme.accent
    }
    Column {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom }

        Label {
            width: parent.width
            strong: true
            text: root.title
            color: root.enabled ? Theme.text : Theme.disabled
        }
        Label {
            width: parent.width
            kind: Label.Small
            muted: true
            text: root.connecting ? "Connecting" : root.subtitle
        }
    }
}
