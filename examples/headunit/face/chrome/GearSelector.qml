import QtQuick 2.15
import HeadUnit 1.0
import ".."
import "../controls"

/** The gears in a row. */
Row {
    id: root

    readonly property var gears: ["P", "R", "N", "D"]

    spacing: 4

    Repeater {
        model: root.gears

        TouchButton {
            objectName: "gear-" + model.modelData
            width: (root.width - 3 * root.spacing) / 4
            height: 72
            radius: 12
            text: model.modelData
            checked: Vehicle.gear === model.modelData
            onClicked: Vehicle.gear = model.modelData
        }
    }
}
