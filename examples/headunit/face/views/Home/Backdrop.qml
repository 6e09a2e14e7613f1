import QtQuick 2.15
import "../.."

/** An evening sky over hills, dark enough to be read upon. */
Canvas {
    id: root

    property color glow: Theme.accent
    property real strength: 1 ///< of the light on the horizon
    property real horizon: 0.62 ///< where the hills begin, from the top

    function ridge(context, base, height, shift, color) {
        var w = root.width, h = root.height
        context.fillStyle = color
        context.beginPath()
        context.moveTo(0, h)
        for (var x = 0; x <= w + 8; x += 8) {
            var t = x / 180 + shift
            var y = Math.sin(t) * 0.5 + Math.sin(t * 2.3 + shift) * 0.28 + Math.sin(t * 4.1) * 0.08
            context.lineTo(x, (base - height * y) * h)
        }
        context.lineTo(w, h)
        context.closePath()
        context.fill()
    }

    onGlowChanged: root.requestPaint()
    onPaint: {
        var context = root.getContext("2d")
        var w = root.width, h = root.height, g = root.glow
        context.reset()

        var sky = context.createLinearGradient(0, 0, 0, h * root.horizon * 1.2)
        sky.addColorStop(0, Theme.background)
        sky.addColorStop(1, Qt.rgba(0.06 + 0.10 * g.r * root.strength, 0.08 + 0.14 * g.g * root.strength,
                                    0.12 + 0.17 * g.b * root.strength, 1))
        context.fillStyle = sky
        context.fillRect(0, 0, w, h)

        var light = context.createRadialGradient(w * 0.2, h * root.horizon, 0, w * 0.2, h * root.horizon, w * 0.5)
        light.addColorStop(0, Qt.rgba(g.r, g.g, g.b, 0.24 * root.strength))
        light.addColorStop(0.45, Qt.rgba(g.r, g.g, g.b, 0.10 * root.strength))
        light.addColorStop(1, Qt.rgba(g.r, g.g, g.b, 0))
        context.fillStyle = light
        context.fillRect(0, 0, w, h)

        root.ridge(context, root.horizon, 0.09, 0.4, "#122032")
        root.ridge(context, root.horizon + 0.13, 0.08, 2.1, "#0e1826")
        root.ridge(context, root.horizon + 0.26, 0.07, 4.4, "#0a111b")
    }
}
