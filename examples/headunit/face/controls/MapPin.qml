import QtQuick 2.15
import ".."

/** A pin that stands on a place; a sign on it tells pins apart. */
Item {
    id: root

    property string sign
    property color colour: Theme.critical

    width: 60
    height: 72

    Icon {
        anchors.horizontalCenter: parent.horizontalCenter
        y: 2
        name: "place"
        size: 76
        color: "#0a0f15"
    }
    Icon {
        anchors.horizontalCenter: parent.horizontalCenter
        y: 5
        name: "place"
        size: 68
        color: root.colour
    }
    Rectangle {
        anchors.horizontalCenter: parent.horizontalCenter
        y: 14
        width: 34
        height: 34
        radius: 17
        color: "#ffffff"

        Icon {
            anchors.centerIn: parent
            visible: root.sign === ""
            name: "sports_score"
            size: 26
            color: "#0a0f15"
        }
        Text {
            anchors.centerIn: parent
            text: root.sign
            color: "#0a0f15"
            font { family: Theme.font; pixelSize: Theme.small; weight: Font.Bold }
        }
    }
}
