import QtQuick 2.15
import ".."
import "../controls"

/** The caller's initials in a disc, with a ring that spreads as long as it rings. */
Item {
    id: root

    property string caller ///< empty when nobody knows
    readonly property string initials: root.caller.split(" ").map(word => word.charAt(0)).join("").slice(0, 2)

    width: 116
    height: 116

    Rectangle {
        id: ring

        anchors.centerIn: parent
        width: 116
        height: 116
        radius: 58
        color: "transparent"
        border.width: 3
        border.color: Theme.positive

        ParallelAnimation {
            running: root.visible
            loops: Animation.Infinite

            NumberAnimation {
                target: ring
                property: "scale"
                from: 0.9
                to: 1.25
                duration: 1400
                easing.type: Easing.OutCubic
            }
            NumberAnimation {
                target: ring
                property: "opacity"
                from: 0.8
                to: 0
                duration: 1400
            }
        }
    }

    Rectangle {
        anchors.centerIn: parent
        width: 104
        height: 104
        radius: 52
        color: Qt.darker(Theme.positive, 2.6)

        Icon {
            anchors.centerIn: parent
            visible: root.caller === ""
            name: "person"
            size: 64
            color: Theme.positive
        }

        Label {
            anchors.centerIn: parent
            text: root.initials.toUpperCase()
            kind: Label.Title
            color: Theme.positive
        }
    }
}
