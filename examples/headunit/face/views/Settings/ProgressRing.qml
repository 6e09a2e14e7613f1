import QtQuick 2.15
import QtQuick.Shapes 1.15

/** A ring that closes as the value goes from 0 to 1. */
Item {
    id: root

    property real value: 0
    property color groove
    property color colour
    readonly property real thickness: 18

    Shape {
        anchors.fill: parent

        ShapePath {
            strokeColor: root.groove
            strokeWidth: root.thickness
            fillColor: "transparent"

            PathAngleArc {
                centerX: root.width / 2
                centerY: root.height / 2
                radiusX: (root.width - root.thickness) / 2
                radiusY: radiusX
                sweepAngle: 360
            }
        }
        ShapePath {
            strokeColor: root.colour
            strokeWidth: root.thickness
            capStyle: ShapePath.RoundCap
            fillColor: "transparent"

            PathAngleArc {
                centerX: root.width / 2
                centerY: root.height / 2
                radiusX: (root.width - root.thickness) / 2
                radiusY: radiusX
                startAngle: -90
                sweepAngle: 360 * root.value
            }
        }
    }
}
