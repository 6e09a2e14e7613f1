import QtQuick 2.15

/** A car that stands in the space beside the free one, its tail towards the camera. */
CameraLens {
    id: root

    property real middle: -2.6 ///< of the car, in metres from the middle of the picture
    property real near: 1.3
    property color paint: "#48617a"

    // The tail, of which the left and the right half are alike: one half as [half width, height, metres from the tail].
    function tail(context, half, color) {
        var places = half.map(function(p) { return [root.middle + p[0], p[1], root.near + p[2]] })
        var other = half.map(function(p) { return [root.middle - p[0], p[1], root.near + p[2]] })
        root.fill(context, places.concat(other.reverse()), color)
    }

    // The side that can be seen: places as [height, metres from the tail]. The windows lean inwards.
    function side(context, places, color) {
        var inwards = root.middle < 0 ? 1 : -1
        root.fill(context, places.map(function(p) {
            var half = 0.9 - Math.max(0, p[0] - 0.97) * 0.62
            return [root.middle + inwards * half, p[0], root.near + p[1]]
        }), color)
    }

    function wheel(context, distance) {
        for (var ring = 0; ring < 2; ++ring) {
            var places = []
            for (var i = 0; i < 24; ++i) {
                var angle = i * Math.PI / 12
                var size = ring ? 0.2 : 0.33
                places.push([0.33 + size * Math.sin(angle), distance + size * Math.cos(angle)])
            }
            root.side(context, places, ring ? "#737a84" : "#121418")
        }
    }

    function drawSide(context) {
        root.side(context, [[0.28, 0], [0.95, 0], [1.0, 0.5], [0.98, 2.6], [0.82, 3.9], [0.3, 4.1]], Qt.darker(root.paint, 1.5))
        root.side(context, [[0.97, 0.1], [1.42, 0.6], [1.42, 1.9], [0.98, 2.8]], Qt.darker(root.paint, 1.75))
        root.side(context, [[1.02, 0.45], [1.35, 0.78], [1.36, 1.8], [1.03, 2.5]], "#18202a")
        root.wheel(context, 0.75)
        root.wheel(context, 3.25)
    }

    function drawTail(context) {
        root.tail(context, [[0.9, 0.97, 0.1], [0.62, 1.42, 0.6]], Qt.darker(root.paint, 1.15))
        root.tail(context, [[0.76, 1.02, 0.15], [0.56, 1.36, 0.53]], "#1b2530")
        root.tail(context, [[0.84, 0.22, 0], [0.91, 0.5, 0], [0.9, 0.8, 0], [0.88, 0.98, 0.08]], root.paint)
        root.tail(context, [[0.9, 0.86, 0], [0.88, 0.98, 0.08]], Qt.lighter(root.paint, 1.25))
        root.tail(context, [[0.84, 0.22, 0], [0.91, 0.42, 0]], "#1d2127")
        root.tail(context, [[0.26, 0.56, 0], [0.26, 0.68, 0]], "#d6d9dd")
        for (var i = -1; i < 2; i += 2) {
            var x = root.middle + i * 0.66
            root.fill(context, [[x - 0.2, 0.7, root.near], [x + 0.2, 0.7, root.near],
                                [x + 0.2, 0.84, root.near], [x - 0.2, 0.84, root.near]], "#c8323a")
        }
    }

    onPaint: {
        var context = root.getContext("2d")
        context.reset()
        root.strip(context, root.middle - 1.05, root.middle + 1.05, root.near - 0.25, root.near + 4.3, "#80000000")
        root.drawSide(context)
        root.drawTail(context)
    }
}
