import QtQuick 2.15
import "../.."
import "../../controls"

/** One application: a large symbol with its name below. */
Card {
    id: root

    property string icon
    property string title
    property color iconColor: Theme.accent

    padding: 12
    touchable: true

    Rectangle {
        id: ground
        anchors { horizontalCenter: parent.horizontalCenter; top: parent.top; topMargin: 24 }
        width: 104
        height: 104
        radius: 32
        gradient: Gradient {
            GradientStop { position: 0; color: Qt.rgba(root.iconColor.r, root.iconColor.g, root.iconColor.b, 0.32) }
            GradientStop { position: 1; color: Qt.rgba(root.iconColor.r, root.iconColor.g, root.iconColor.b, 0.12) }
        }

        Icon {
            anchors.centerIn: parent
            name: root.icon
            size: 54
            color: root.iconColor
        }
    }
    Label {
        anchors { left: parent.left; right: parent.right; top: ground.bottom; topMargin: 20 }
        kind: Label.Small
        horizontalAlignment: Text.AlignHCenter
        font.weight: Font.Medium
        text: root.title
    }
}
