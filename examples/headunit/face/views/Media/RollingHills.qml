import QtQuick 2.15

/** A row of hills that passes by; it is painted once, and repeats itself after its period. */
Item {
    id: root

    property color near: "#203040" ///< at the crest
    property color far: "#101820" ///< at the foot
    property real relief: 60 ///< how high the hills are
    property real shift: 0
    property int period: 1600
    property int duration: 60000
    property bool running: true
    property bool trees: false
    readonly property real headroom: root.trees ? 64 : 0 ///< what the trees need above the hills

    function crest(x) {
        var t = 2 * Math.PI * x / root.period
        return root.relief * (0.5 - 0.26 * Math.sin(t + root.shift) - 0.14 * Math.sin(3 * t + 2 * root.shift)
                              - 0.07 * Math.sin(7 * t + root.shift))
    }

    clip: true

    Canvas {
        id: picture

        function drawTree(context, x, y, size) {
            context.fillStyle = root.far
            context.beginPath()
            context.moveTo(x, y - size)
            context.lineTo(x + size * 0.26, y + 4)
            context.lineTo(x - size * 0.26, y + 4)
            context.closePath()
            context.fill()
        }

        width: root.width + root.period
        height: root.height
        onPaint: {
            var context = picture.getContext("2d")
            context.reset()
            var paint = context.createLinearGradient(0, 0, 0, root.height)
            paint.addColorStop(0, root.near)
            paint.addColorStop(1, root.far)
            for (var i = 0; root.trees && i < picture.width / 29; ++i) {
                var place = (i * 29) % root.period
                var seed = (place * 37) % 101
                if (seed < 62)
                    picture.drawTree(context, i * 29, root.crest(i * 29) + root.headroom, 30 + seed * 0.5)
            }
            context.fillStyle = paint
            context.beginPath()
            context.moveTo(0, root.height)
            for (var x = 0; x <= picture.width + 6; x += 6)
                context.lineTo(x, root.crest(x) + root.headroom)
            context.lineTo(picture.width, root.height)
            context.closePath()
            context.fill()
        }

        NumberAnimation on x {
            from: 0
            to: -root.period
            duration: root.duration
            loops: Animation.Infinite
            paused: !root.running
        }
    }
}
