import QtQuick 2.15
import ".."
import "../controls"

/** A whole number of the car's to be drawn along a bar, with its value beside it. */
Item {
    id: root

    property string icon
    property string unit
    property int value: 0
    property int maximum: 100

    signal moved(int value)

    height: 72

    Icon {
        id: sign

        anchors.verticalCenter: parent.verticalCenter
        name: root.icon
        size: 28
        color: Theme.secondary
    }

    SliderBar {
        anchors.left: sign.right
        anchors.leftMargin: 12
        anchors.right: number.left
        anchors.rightMargin: 8
        value: root.value / root.maximum
        onMoved: root.moved(Math.round(value * root.maximum))
    }

    Label {
        id: number

        anchors.right: parent.right
        anchors.verticalCenter: parent.verticalCenter
        width: 104
        horizontalAlignment: Text.AlignRight
        text: root.value + " " + root.unit
        kind: Label.Small
    }
}
