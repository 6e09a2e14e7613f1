import QtQuick 2.15
import ".."
import "../controls"

/** A round key beside the screen, with the ring that lights up while it is held. */
MouseArea {
    id: root

    property string key
    property string icon

    objectName: "key-" + root.key
    width: 96
    height: 132
    onPressed: press.press()
    onReleased: root.containsMouse ? press.release() : press.abandon()
    onCanceled: press.abandon()

    KeyPress {
        id: press

        key: root.key
    }

    Rectangle {
        id: cap

        anchors.horizontalCenter: parent.horizontalCenter
        y: 10
        width: 72
        height: 72
        radius: 36
        scale: press.pressed ? 0.95 : 1
        border.width: 2
        border.color: press.held ? Theme.accent : Theme.line
        gradient: Gradient {
            GradientStop {
                position: 0
                color: press.pressed ? Theme.pressed : Theme.raised
            }
            GradientStop {
                position: 1
                color: press.pressed ? Theme.raised : Theme.surface
            }
        }

        Behavior on scale {
            NumberAnimation { duration: 80 }
        }

        Icon {
            anchors.centerIn: parent
            name: root.icon
            size: 34
            color: press.held ? Theme.accent : Theme.text
        }
    }

    Label {
        anchors.horizontalCenter: parent.horizontalCenter
        anchors.top: cap.bottom
        anchors.topMargin: 8
        text: root.key
        kind: Label.Small
        muted: true
    }
}
