import QtQuick 2.15
import "../.."
import "../../controls"

/** A favourite: large enough to be hit without looking for long. */
Card {
    id: root

    property string name
    property string number
    property color tint

    touchable: true

    Avatar {
        width: 92
        name: root.name
        tint: root.tint
    }
    Icon {
        anchors.right: parent.right
        name: "star"
        size: 30
        color: Theme.warning
    }
    Column {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom }
        spacing: 2

        Label {
            width: parent.width
            text: root.name
            font.weight: Font.Medium
        }
        Label {
            width: parent.width
            kind: Label.Small
            muted: true
            text: root.number
        }
    }
}
