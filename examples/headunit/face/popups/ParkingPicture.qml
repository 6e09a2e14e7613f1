import QtQuick 2.15
import ".."

/** The rear of the car from above, and the zones behind it up to what is in the way. */
Item {
    id: root

    property int centimetres: 0
    property color ink: Theme.positive
    /** Of the four zones, the one that the obstacle is in; 0 is the nearest. */
    readonly property int zone: Math.min(3, Math.floor(root.centimetres / 40))

    width: 284
    height: 264
    clip: true

    Rectangle {
        id: body

        anchors.horizontalCenter: parent.horizontalCenter
        y: -24
        width: 116
        height: 148
        radius: 30
        color: Theme.pressed
        border.width: 2
        border.color: Theme.disabled
    }

    Rectangle {
        anchors.horizontalCenter: parent.horizontalCenter
        y: 62
        width: 84
        height: 30
        radius: 12
        color: Theme.background
    }

    Repeater {
        model: 4

        ParkingZone {
            anchors.fill: parent
            reach: 84 + 36 * model.index
            ink: model.index === root.zone ? root.ink
                : model.index > root.zone ? Theme.raised : Theme.pressed
        }
    }
}
