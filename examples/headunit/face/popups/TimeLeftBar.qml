import QtQuick 2.15
import ".."

/** A thin line that shrinks towards its middle with the time that is left. */
Item {
    id: root

    property real share: 0

    height: 4

    Rectangle {
        objectName: "timeLeft"
        anchors.horizontalCenter: parent.horizontalCenter
        width: Math.round(root.width * root.share)
        height: parent.height
        radius: 2
        color: Theme.accent

        Behavior on width {
            NumberAnimation { duration: 90 }
        }
    }
}
