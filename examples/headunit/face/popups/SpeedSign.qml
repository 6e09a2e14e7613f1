import QtQuick 2.15
import ".."
import "../controls"

/** The road sign of a speed limit. */
Rectangle {
    id: root

    property int limit: 0
    property int size: 104

    width: root.size
    height: root.size
    radius: root.size / 2
    color: Theme.text
    border.width: Math.round(root.size * 0.11)
    border.color: Theme.critical

    Label {
        anchors.centerIn: parent
        text: root.limit
        color: Theme.background
        font.pixelSize: Math.round(root.size * (root.limit > 99 ? 0.34 : 0.42))
        font.weight: Font.Bold
    }
}
