import QtQuick 2.15
import QtQuick.Shapes 1.15

/** One of the arcs behind the car. */
Shape {
    id: root

    property real reach: 100
    property color ink

    ShapePath {
        strokeColor: root.ink
        strokeWidth: 14
        fillColor: "transparent"
        capStyle: ShapePath.RoundCap

        PathAngleArc {
            centerX: root.width / 2
            centerY: 64
            radiusX: root.reach
            radiusY: root.reach
            startAngle: 48
            sweepAngle: 84
        }
    }
}
