import QtQuick 2.15

/** A picture as the rear camera sees it: places of the world, in metres, become points of the picture. */
Canvas {
    id: root

    readonly property real horizon: 0.31 * root.height
    readonly property real focalLength: 0.45 * root.width
    readonly property real cameraHeight: 1.1 ///< above the ground
    readonly property real cameraDistance: 1.55 ///< to the nearest ground that is seen well

    /** x to the right of the middle, y above the ground, z away from the car. */
    function at(x, y, z) {
        var scale = root.focalLength / (root.cameraDistance + z)
        return Qt.point(root.width / 2 + x * scale, root.horizon + (root.cameraHeight - y) * scale)
    }

    /** Begins a path through places that are given as [x, y, z]. */
    function path(context, places) {
        context.beginPath()
        for (var i = 0; i < places.length; ++i) {
            var point = root.at(places[i][0], places[i][1], places[i][2])
            if (i === 0)
                context.moveTo(point.x, point.y)
            else
                context.lineTo(point.x, point.y)
        }
    }

    function fill(context, places, color) {
        root.path(context, places)
        context.closePath()
        context.fillStyle = color
        context.fill()
    }

    /** A piece of the ground, parallel to the car. */
    function strip(context, x1, x2, z1, z2, color) {
        root.fill(context, [[x1, 0, z1], [x2, 0, z1], [x2, 0, z2], [x1, 0, z2]], color)
    }
}
