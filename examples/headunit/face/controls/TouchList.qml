import QtQuick 2.15
import ".."

/** A list to be moved with the finger, with a hint at the right of how much there is. */
ListView {
    id: root

    clip: true
    boundsBehavior: Flickable.StopAtBounds
    cacheBuffer: 400

    Rectangle {
        parent: root
        anchors.right: parent.right
        visible: root.visibleArea.heightRatio < 1
        width: 6
        radius: 3
        color: Theme.line
        y: root.visibleArea.yPosition * root.height
        height: root.visibleArea.heightRatio * root.height
    }
}
