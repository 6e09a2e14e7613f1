import QtQuick 2.15
import QtQuick.Shapes 1.15

/** A line along streets, such as a route, over the ground of a map. */
Shape {
    id: root

    property var line: []
    property real zoom: 1
    property real thickness: 10
    property color colour
    property color edge: "transparent"
    property real edgeThickness: 0

    readonly property var path: root.line.map(p => Qt.point(p.x * root.zoom, p.y * root.zoom))
    readonly property rect bounds: root.boundsOf(root.path)

    function boundsOf(path) {
        const xs = path.map(p => p.x), ys = path.map(p => p.y)
        const left = Math.min(...xs), top = Math.min(...ys)
        return Qt.rect(left, top, Math.max(...xs) - left, Math.max(...ys) - top)
    }

    function isIn(window) {
        return root.bounds.left < window.right && root.bounds.right > window.left
            && root.bounds.top < window.bottom && root.bounds.bottom > window.top
    }

    ShapePath {
        strokeColor: root.edge
        strokeWidth: root.edgeThickness > 0 ? root.thickness + 2 * root.edgeThickness : -1
        fillColor: "transparent"
        capStyle: ShapePath.RoundCap
        joinStyle: ShapePath.RoundJoin

        PathPolyline { path: root.path }
    }
    ShapePath {
        strokeColor: root.colour
        strokeWidth: root.thickness
        fillColor: "transparent"
        capStyle: ShapePath.RoundCap
        joinStyle: ShapePath.RoundJoin

        PathPolyline { path: root.path }
    }
}
