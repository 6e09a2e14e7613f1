import QtQuick 2.15
import "../.."
import "../../controls"

/** An album: its cover, and below it the title. */
Item {
    id: root

    property var album
    property bool selected: false
    readonly property real side: Math.min(root.width, root.height - 36)

    signal clicked()

    Rectangle {
        width: root.side
        height: root.side
        radius: Theme.radius + 4
        visible: root.selected
        color: "transparent"
        border { width: 4; color: Theme.accent }
    }
    CoverArt {
        x: root.selected ? 8 : 0
        y: x
        width: root.side - 2 * x
        height: width
        opacity: touch.pressed ? 0.6 : 1
        first: root.album.first
        second: root.album.second
        pattern: root.album.pattern
    }
    Label {
        anchors { left: parent.left; right: parent.right; rightMargin: -16; bottom: parent.bottom }
        kind: Label.Small
        text: root.album.title
        color: root.selected ? Theme.accent : Theme.text
    }
    MouseArea {
        id: touch
        anchors.fill: parent
        onClicked: root.clicked()
    }
}
