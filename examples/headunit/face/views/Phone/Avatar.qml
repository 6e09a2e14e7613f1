import QtQuick 2.15
import "../.."
import "../../controls"

/** The initials of somebody in a circle, in place of a photo. */
Rectangle {
    id: root

    property string name
    readonly property bool unknown: root.name === "Unknown caller"
    property color tint: "#4a5968"
    readonly property string initials: root.name.split(" ").slice(0, 2).map(word => word.charAt(0)).join("").toUpperCase()

    width: 60
    height: root.width
    radius: root.width / 2
    color: Qt.darker(root.tint, 1.15)
    antialiasing: true

    Icon {
        anchors.centerIn: parent
        visible: root.unknown
        name: "person"
        size: Math.round(root.width * 0.56)
    }
    Text {
        visible: !root.unknown
        anchors.centerIn: parent
        text: root.initials
        color: "#ffffff"
        font { family: Theme.font; pixelSize: Math.max(Theme.small, root.width * 0.36); weight: Font.Medium }
    }
}
