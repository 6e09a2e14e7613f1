import QtQuick 2.15
import "../controls"

/** A symbol in a tinted disc. */
Rectangle {
    id: root

    property string icon
    property color ink
    property int size: 72

    width: root.size
    height: root.size
    radius: root.size / 2
    color: Qt.rgba(root.ink.r, root.ink.g, root.ink.b, 0.16)

    Icon {
        anchors.centerIn: parent
        name: root.icon
        size: Math.round(root.size * 0.54)
        color: root.ink
    }
}
