import QtQuick 2.15

/** A car from above, its front at the top, with four seats. */
Canvas {
    id: root

    property color body
    property color glass
    property color seat
    property color line

    // Half of the outline as parts of the width and the height, from the nose to the tail.
    function outline(ctx, inset) {
        const w = root.width / 2 - inset, h = root.height - 2 * inset
        const at = (x, y) => [root.width / 2 + x * w, inset + y * h]
        const curve = (a, b, c) => ctx.bezierCurveTo(...at(...a), ...at(...b), ...at(...c))
        ctx.beginPath()
        ctx.moveTo(...at(0, 0))
        curve([0.55, 0], [0.86, 0.03], [0.9, 0.16])
        curve([0.96, 0.34], [0.94, 0.6], [0.93, 0.82])
        curve([0.92, 0.95], [0.7, 1], [0, 1])
        curve([-0.7, 1], [-0.92, 0.95], [-0.93, 0.82])
        curve([-0.94, 0.6], [-0.96, 0.34], [-0.9, 0.16])
        curve([-0.86, 0.03], [-0.55, 0], [0, 0])
        ctx.closePath()
    }

    function rounded(ctx, x, y, w, h, r, colour) {
        ctx.beginPath()
        ctx.roundedRect(x, y, w, h, r, r)
        ctx.fillStyle = colour
        ctx.fill()
    }

    onPaint: {
        const ctx = root.getContext("2d")
        const middle = root.width / 2
        ctx.reset()
        root.rounded(ctx, 0, root.height * 0.3, 22, 14, 6, root.line)
        root.rounded(ctx, root.width - 22, root.height * 0.3, 22, 14, 6, root.line)
        root.outline(ctx, 2)
        ctx.fillStyle = root.body
        ctx.fill()
        ctx.lineWidth = 2
        ctx.strokeStyle = root.line
        ctx.stroke()

        // The cabin, from the windscreen to the rear window.
        ctx.beginPath()
        ctx.moveTo(middle - 84, root.height * 0.33)
        ctx.quadraticCurveTo(middle, root.height * 0.25, middle + 84, root.height * 0.33)
        ctx.lineTo(middle + 86, root.height * 0.84)
        ctx.quadraticCurveTo(middle, root.height * 0.9, middle - 86, root.height * 0.84)
        ctx.closePath()
        ctx.fillStyle = root.glass
        ctx.fill()
        for (const side of [-1, 1]) {
            for (const row of [0.42, 0.63]) {
                const x = middle + side * 41 - 32, y = root.height * row
                root.rounded(ctx, x, y, 64, 62, 16, root.seat)
                root.rounded(ctx, x + 4, y + 50, 56, 20, 9, root.line)
            }
        }
    }
}
