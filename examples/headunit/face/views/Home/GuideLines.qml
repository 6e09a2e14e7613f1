import QtQuick 2.15
import "../.."

/** Where the car will go: its width, and how far away things are. */
CameraLens {
    id: root

    readonly property real halfWidth: 0.98

    function rails(context, z1, z2, color) {
        context.strokeStyle = color
        for (var i = -1; i < 2; i += 2) {
            root.path(context, [[i * root.halfWidth, 0, z1], [i * root.halfWidth, 0, z2]])
            context.stroke()
        }
    }

    // With a bar across, whole or only at the ends.
    function bar(context, z, length, color) {
        context.strokeStyle = color
        for (var i = -1; i < 2; i += 2) {
            root.path(context, [[i * root.halfWidth, 0, z], [i * (root.halfWidth - length), 0, z]])
            context.stroke()
        }
    }

    onPaint: {
        var context = root.getContext("2d")
        context.reset()
        root.strip(context, -root.halfWidth, root.halfWidth, 0.02, 0.45, "#30ff4d4f")
        context.lineCap = "round"
        context.lineJoin = "round"
        context.lineWidth = 6
        root.rails(context, 1.6, 3.4, Theme.positive)
        root.bar(context, 3.4, 0.35, Theme.positive)
        root.rails(context, 0.5, 1.5, Theme.warning)
        root.bar(context, 1.5, 0.35, Theme.warning)
        context.lineWidth = 8
        root.rails(context, 0.02, 0.45, Theme.critical)
        root.bar(context, 0.45, root.halfWidth, Theme.critical)
    }
}
