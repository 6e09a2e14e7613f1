import QtQuick 2.15
import ".."

/** The cover of an album, drawn from two colours and the number of a pattern. */
Canvas {
    id: root

    property color first: "#3da9fc"
    property color second: "#123a5c"
    property int pattern: 0
    property real radius: Theme.radius

    function clipRounded(context) {
        context.beginPath()
        context.roundedRect(0, 0, root.width, root.height, root.radius, root.radius)
        context.clip()
    }

    function disc(context, x, y, r, color) {
        context.fillStyle = color
        context.beginPath()
        context.arc(x * root.width, y * root.width, r * root.width, 0, 2 * Math.PI)
        context.fill()
    }

    // A dune or a wave from the left edge to the right one, filled down to the bottom.
    function hill(context, left, bend, right, color) {
        var w = root.width
        context.fillStyle = color
        context.beginPath()
        context.moveTo(0, left * w)
        context.bezierCurveTo(0.35 * w, bend * w, 0.6 * w, (left + right - bend) * w, w, right * w)
        context.lineTo(w, w)
        context.lineTo(0, w)
        context.closePath()
        context.fill()
    }

    function drawPattern(context, light, dark) {
        var w = root.width, i
        switch (root.pattern % 6) {
        case 0:
            root.disc(context, 0.62, 0.4, 0.2, light)
            root.hill(context, 0.62, 0.42, 0.7, Qt.rgba(dark.r, dark.g, dark.b, 0.55))
            root.hill(context, 0.86, 0.66, 0.74, dark)
            break
        case 1:
            for (i = 5; i > 0; --i)
                root.disc(context, 0.5, 1, i * 0.17, i % 2 ? light : dark)
            break
        case 2:
            context.lineWidth = 0.06 * w
            context.strokeStyle = light
            for (i = 0; i < 5; ++i) {
                context.beginPath()
                context.moveTo((-0.1 + i * 0.13) * w, 1.1 * w)
                context.lineTo((0.55 + i * 0.13) * w, (0.25 + i * 0.09) * w)
                context.stroke()
            }
            root.disc(context, 0.28, 0.3, 0.12, light)
            break
        case 3:
            root.disc(context, 0.38, 0.5, 0.26, Qt.rgba(light.r, light.g, light.b, 0.75))
            root.disc(context, 0.64, 0.5, 0.26, Qt.rgba(dark.r, dark.g, dark.b, 0.75))
            break
        case 4:
            for (i = 0; i < 5; ++i)
                root.hill(context, 0.35 + i * 0.13, 0.2 + i * 0.14, 0.42 + i * 0.12,
                          Qt.rgba(light.r + (dark.r - light.r) * i / 4, light.g + (dark.g - light.g) * i / 4,
                                  light.b + (dark.b - light.b) * i / 4, 0.8))
            break
        default:
            context.fillStyle = light
            for (i = 0; i < 9; ++i) {
                var height = (0.18 + 0.5 * Math.abs(Math.sin(i * 1.7 + 0.6))) * w
                context.fillRect((0.14 + i * 0.083) * w, (w - height) / 2, 0.045 * w, height)
            }
        }
    }

    implicitWidth: 96
    implicitHeight: root.implicitWidth
    onFirstChanged: root.requestPaint()
    onSecondChanged: root.requestPaint()
    onPatternChanged: root.requestPaint()
    onPaint: {
        var context = root.getContext("2d")
        context.reset()
        root.clipRounded(context)
        var ground = context.createLinearGradient(0, 0, root.width * 0.4, root.width)
        ground.addColorStop(0, root.first)
        ground.addColorStop(1, root.second)
        context.fillStyle = ground
        context.fillRect(0, 0, root.width, root.height)
        root.drawPattern(context, Qt.lighter(root.first, 1.35), Qt.darker(root.second, 1.5))
    }
}
