import QtQuick 2.15
import ".."
import "../controls"

/** The soft key of a domain; the current one has a bar at its top. */
MouseArea {
    id: root

    property string domain
    property bool current: false

    readonly property color ink: root.current ? Theme.accent : Theme.secondary

    objectName: "domain-" + root.domain

    Rectangle {
        anchors.fill: parent
        anchors.topMargin: 1
        color: Theme.pressed
        opacity: root.pressed ? 1 : 0
    }

    Rectangle {
        anchors.horizontalCenter: parent.horizontalCenter
        width: 96
        height: 4
        radius: 2
        color: Theme.accent
        opacity: root.current ? 1 : 0

        Behavior on opacity {
            NumberAnimation { duration: 200 }
        }
    }

    Row {
        anchors.centerIn: parent
        spacing: 12

        DomainIcon {
            anchors.verticalCenter: parent.verticalCenter
            domain: root.domain
            size: 32
            color: root.ink
        }

        Label {
            anchors.verticalCenter: parent.verticalCenter
            text: root.domain
            kind: Label.Small
            color: root.current ? Theme.text : Theme.secondary
        }
    }
}
