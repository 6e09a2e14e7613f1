import QtQuick 2.15
import ".."
import "../controls"

/** The handle at the edge of the display that folds the panels in and out. */
MouseArea {
    id: root

    property bool open: false

    width: 24
    height: 96

    Rectangle {
        id: tab

        anchors.fill: parent
        anchors.leftMargin: 2
        radius: 8
        color: root.pressed ? Theme.pressed : Theme.raised
        border.color: Theme.line
        opacity: root.open || root.pressed ? 1 : 0.6
    }

    Icon {
        anchors.centerIn: tab
        name: root.open ? "chevron_left" : "chevron_right"
        size: 22
        color: Theme.secondary
    }
}
