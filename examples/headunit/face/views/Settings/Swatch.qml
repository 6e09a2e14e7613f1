import QtQuick 2.15
import "../.."
import "../../controls"

/** A colour to choose. */
Item {
    id: root

    property color colour
    property bool chosen: false

    signal clicked()

    width: 80
    height: 80

    Rectangle {
        anchors.centerIn: parent
        visible: root.chosen
        width: 78
        height: 78
        radius: 39
        color: "transparent"
        border { width: 3; color: root.colour }
    }
    Rectangle {
        anchors.centerIn: parent
        width: 62
        height: 62
        radius: 31
        color: root.colour
    }
    Icon {
        anchors.centerIn: parent
        visible: root.chosen
        name: "check"
        color: Theme.accentText
    }
    MouseArea {
        anchors.fill: parent
        onClicked: root.clicked()
    }
}
