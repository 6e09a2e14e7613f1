import QtQuick 2.15
import ".."

/** A rounded surface for things that belong together; one that is touchable can be pressed as a whole. */
Rectangle {
    id: root

    property bool touchable: false
    property real padding: 24
    readonly property bool pressed: touch.pressed
    default property alias content: inside.data

    signal clicked()

    radius: Theme.radius
    color: root.pressed ? Theme.pressed : Theme.surface
    border.width: 1
    border.color: root.pressed ? Theme.pressed : Theme.raised

    MouseArea {
        id: touch
        anchors.fill: parent
        enabled: root.touchable
        onClicked: root.clicked()
    }

    Item {
        id: inside
        anchors.fill: parent
        anchors.margins: root.padding
    }
}
