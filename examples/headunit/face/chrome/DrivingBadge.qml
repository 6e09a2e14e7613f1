import QtQuick 2.15
import ".."
import "../controls"

/** Tells the driver that some things have to wait, and how fast one may go. */
Row {
    id: root

    property bool shown: false
    property int speed: 0
    readonly property int limit: 130

    spacing: 12
    opacity: root.shown ? 1 : 0

    Behavior on opacity {
        NumberAnimation { duration: 200 }
    }

    Rectangle {
        anchors.verticalCenter: parent.verticalCenter
        width: sign.implicitWidth + 28
        height: 38
        radius: 19
        color: root.speed > root.limit ? Theme.critical : "transparent"
        border.width: 3
        border.color: Theme.critical

        Label {
            id: sign

            anchors.centerIn: parent
            text: root.limit
            kind: Label.Small
        }
    }

    Label {
        anchors.verticalCenter: parent.verticalCenter
        text: root.speed + " km/h"
        kind: Label.Small
        color: root.speed > root.limit ? Theme.critical : Theme.text
    }

    Icon {
        anchors.verticalCenter: parent.verticalCenter
        name: "lock"
        size: 22
        color: Theme.warning
    }
}
