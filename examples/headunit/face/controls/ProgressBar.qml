import QtQuick 2.15
import ".."

/** How far something has come, from 0 to 1. */
Rectangle {
    id: root

    property real value: 0
    property color barColor: Theme.accent

    implicitWidth: 400
    implicitHeight: 8
    radius: root.height / 2
    color: Theme.pressed

    Rectangle {
        width: Math.max(root.height, root.width * Math.max(0, Math.min(1, root.value)))
        height: root.height
        radius: root.radius
        color: root.barColor
    }
}
