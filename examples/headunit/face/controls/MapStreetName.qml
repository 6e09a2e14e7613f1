import QtQuick 2.15
import ".."

/** A name that lies along a line, always readable from below. */
Text {
    id: root

    property var line
    property real at: 0 ///< in samples of the line
    property real zoom: 1

    readonly property int from: Math.floor(root.at)
    readonly property var a: root.line[root.from]
    readonly property var b: root.line[root.from + 1]
    readonly property real slope: Math.atan2(root.b.y - root.a.y, root.b.x - root.a.x) * 180 / Math.PI

    x: (root.a.x + (root.b.x - root.a.x) * (root.at - root.from)) * root.zoom - root.width / 2
    y: (root.a.y + (root.b.y - root.a.y) * (root.at - root.from)) * root.zoom - root.height / 2
    rotation: root.slope > 90 ? root.slope - 180 : root.slope < -90 ? root.slope + 180 : root.slope
    font { family: Theme.font; pixelSize: Theme.small; weight: Font.Medium }
    style: Text.Outline
}
