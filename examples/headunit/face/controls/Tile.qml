import QtQuick 2.15
import ".."

/** A large thing to touch: an icon on a coloured ground, and below it a title and what there is to say. */
Card {
    id: root

    property string icon
    property string title
    property string subtitle
    property color iconColor: Theme.accent

    implicitWidth: 260
    implicitHeight: 200
    touchable: true

    Rectangle {
        width: 64
        height: 64
        radius: 20
        color: Qt.rgba(root.iconColor.r, root.iconColor.g, root.iconColor.b, 0.16)

        Icon {
            anchors.centerIn: parent
            name: root.icon
            size: 36
            color: root.enabled ? root.iconColor : Theme.disabled
        }
    }
    Column {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom }

        Label {
            width: parent.width
            text: root.title
            font.weight: Font.Medium
            color: root.enabled ? Theme.text : Theme.disabled
        }
        Label {
            width: parent.width
            visible: root.subtitle !== ""
            kind: Label.Small
            muted: true
            text: root.subtitle
        }
    }
}
