import QtQuick 2.15
import "../.."

/** A small piece of a map around the car, with the route when there is one. */
Canvas {
    id: root

    property bool routed: true
    property real radius: Theme.radius
    property color route: Theme.accent
    readonly property point car: Qt.point(root.width * 0.46, root.height * 0.70)

    function trace(context, points, width, color) {
        context.strokeStyle = color
        context.lineWidth = width
        context.beginPath()
        context.moveTo(points[0] * root.width, points[1] * root.height)
        for (var i = 2; i < points.length; i += 2)
            context.lineTo(points[i] * root.width, points[i + 1] * root.height)
        context.stroke()
    }

    function fill(context, points, color) {
        context.fillStyle = color
        context.beginPath()
        context.moveTo(points[0] * root.width, points[1] * root.height)
        for (var i = 2; i < points.length; i += 2)
            context.lineTo(points[i] * root.width, points[i + 1] * root.height)
        context.closePath()
        context.fill()
    }

    function drawGround(context) {
        context.fillStyle = "#141c26"
        context.fillRect(0, 0, root.width, root.height)
        root.fill(context, [0.55, 0.62, 1.1, 0.5, 1.1, 0.86, 0.62, 0.94], "#13291f")
        root.fill(context, [-0.1, 0.28, 0.1, 0.25, 0.16, 0.44, -0.1, 0.5], "#13291f")
        context.lineJoin = "round"
        context.lineCap = "round"
        root.trace(context, [-0.1, 0.16, 0.2, 0.2, 0.45, 0.12, 0.7, 0.14, 1.1, 0.02], 34, "#10304a")
    }

    function drawStreets(context) {
        var i
        for (i = 0; i < 9; ++i)
            root.trace(context, [-0.1, 0.28 + i * 0.105, 1.1, 0.12 + i * 0.105], 5, "#222d3a")
        for (i = 0; i < 6; ++i)
            root.trace(context, [-0.06 + i * 0.2, 1.1, -0.1 + i * 0.2 + 0.06, -0.1], 5, "#222d3a")
        root.trace(context, [-0.1, 0.94, 0.3, 0.86, 0.72, 0.98, 1.1, 0.9], 11, "#2d3a4a")
        root.trace(context, [0.5, 1.1, 0.46, 0.7, 0.45, 0.44, 0.4, 0.2, 0.42, -0.1], 13, "#364556")
        root.trace(context, [-0.1, 0.53, 0.45, 0.44, 1.1, 0.33], 13, "#364556")
    }

    function drawCar(context) {
        var x = root.car.x, y = root.car.y
        context.fillStyle = Qt.rgba(root.route.r, root.route.g, root.route.b, 0.22)
        context.beginPath()
        context.arc(x, y, 42, 0, 2 * Math.PI)
        context.fill()
        context.fillStyle = "#ffffff"
        context.strokeStyle = "#0b0f14"
        context.lineWidth = 3
        context.beginPath()
        context.moveTo(x, y - 24)
        context.lineTo(x + 19, y + 20)
        context.lineTo(x, y + 10)
        context.lineTo(x - 19, y + 20)
        context.closePath()
        context.stroke()
        context.fill()
    }

    onRouteChanged: root.requestPaint()
    onRoutedChanged: root.requestPaint()
    onPaint: {
        var context = root.getContext("2d")
        context.reset()
        context.beginPath()
        context.roundedRect(0, 0, root.width, root.height, root.radius, root.radius)
        context.clip()
        root.drawGround(context)
        root.drawStreets(context)
        if (root.routed) {
            var way = [0.46, 0.7, 0.452, 0.47, 0.458, 0.45, 0.48, 0.435, 1.1, 0.33]
            root.trace(context, way, 17, Qt.darker(root.route, 2.2))
            root.trace(context, way, 11, root.route)
        }
        root.drawCar(context)
    }
}
