import QtQuick 2.15
import ".."

/** A value from 0 to 1 to be drawn along a bar. It tells of the touch; what it is bound to has to follow. */
Item {
    id: root

    property real value: 0
    property bool centred: false ///< fills from the middle, for a value that goes both ways
    readonly property real bounded: Math.max(0, Math.min(1, root.value))
    readonly property real handleX: root.bounded * (root.width - handle.width) + handle.width / 2

    signal moved(real value)

    implicitWidth: 400
    implicitHeight: 72

    Rectangle {
        id: groove
        anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter }
        height: 12
        radius: 6
        color: Theme.pressed
    }
    Rectangle {
        readonly property real start: root.centred ? groove.width / 2 : 0
        anchors.verticalCenter: parent.verticalCenter
        x: Math.min(start, root.handleX)
        width: Math.abs(root.handleX - start)
        height: groove.height
        radius: 6
        color: root.enabled ? Theme.accent : Theme.disabled
    }
    Rectangle {
        anchors.verticalCenter: parent.verticalCenter
        visible: root.centred
        x: (root.width - width) / 2
        width: 4
        height: 28
        radius: 2
        color: Theme.secondary
    }
    Rectangle {
        id: handle
        anchors.verticalCenter: parent.verticalCenter
        x: root.handleX - width / 2
        width: touch.pressed ? 44 : 36
        height: width
        radius: width / 2
        color: Theme.text
    }
    MouseArea {
        id: touch

        function report(x) {
            root.moved(Math.max(0, Math.min(1, (x - 18) / (root.width - 36))))
        }

        anchors.fill: parent
        preventStealing: true
        onPressed: touch.report(mouse.x)
        onPositionChanged: touch.report(mouse.x)
    }
}
