import QtQuick 2.15
import "../.."

/** The maker's sign: a road that leads to the horizon, in a ring. */
Canvas {
    id: root

    property color ring: Theme.accent

    onRingChanged: root.requestPaint()
    onPaint: {
        var context = root.getContext("2d")
        var c = root.width / 2, r = c - 5
        context.reset()
        context.lineWidth = 5
        context.strokeStyle = root.ring
        context.beginPath()
        context.arc(c, c, r, 0, 2 * Math.PI)
        context.stroke()

        context.beginPath()
        context.arc(c, c, r - 12, 0, 2 * Math.PI)
        context.clip()
        context.fillStyle = Qt.rgba(root.ring.r, root.ring.g, root.ring.b, 0.22)
        context.fillRect(0, c, root.width, c)
        context.fillStyle = "#f2f5f8"
        context.beginPath()
        context.moveTo(c - 5, c)
        context.lineTo(c + 5, c)
        context.lineTo(c + 46, root.height)
        context.lineTo(c - 46, root.height)
        context.closePath()
        context.fill()
        context.fillStyle = root.ring
        context.beginPath()
        context.arc(c, c, r * 0.36, Math.PI, 2 * Math.PI)
        context.fill()
    }
}
