import QtQuick 2.15

/** Painter of what does not move on a map: land, blocks, water and streets. Paints only once. */
Canvas {
    id: root

    property MapCity city
    property MapColours colours
    property real zoom: 1
    property point origin: Qt.point(0, 0) ///< the place in the city of the upper left corner

    property bool night: true

    property int seed: 1

    onNightChanged: root.requestPaint()
    onOriginChanged: root.requestPaint()
    onZoomChanged: root.requestPaint()

    // Always the same numbers, so that the city looks the same every time it is painted.
    function chance() {
        root.seed = (root.seed * 16807) % 2147483647
        return root.seed / 2147483647
    }

    function trace(ctx, line) {
        ctx.moveTo(line[0].x, line[0].y)
        for (let i = 1; i < line.length; ++i)
            ctx.lineTo(line[i].x, line[i].y)
    }

    function stroke(ctx, lines, width, colour) {
        ctx.beginPath()
        lines.forEach(line => root.trace(ctx, line))
        ctx.lineWidth = width
        ctx.strokeStyle = colour
        ctx.stroke()
    }

    function rounded(ctx, corners) {
        const closed = root.city.curve(corners, true)
        ctx.beginPath()
        root.trace(ctx, closed)
        ctx.closePath()
    }

    function visibleAt(p, reach) {
        const x = (p.x - root.origin.x) * root.zoom, y = (p.y - root.origin.y) * root.zoom
        const edge = reach * root.zoom
        return x > -edge && y > -edge && x < root.width + edge && y < root.height + edge
    }

    function inside(p, border) {
        let odd = false
        for (let i = 0, j = border.length - 1; i < border.length; j = i++) {
            const a = border[i], b = border[j]
            if ((a.y > p.y) !== (b.y > p.y) && p.x < (b.x - a.x) * (p.y - a.y) / (b.y - a.y) + a.x)
                odd = !odd
        }
        return odd
    }

    onPaint: {
        const ctx = root.getContext("2d")
        root.seed = 20011
        ctx.reset()
        ctx.fillStyle = root.colours.land
        ctx.fillRect(0, 0, root.width, root.height)
        ctx.scale(root.zoom, root.zoom)
        ctx.translate(-root.origin.x, -root.origin.y)
        ctx.lineCap = "round"
        ctx.lineJoin = "round"
        town.paint(ctx)
        nature.paint(ctx)
        streets.paint(ctx)
    }

    MapBlocks { id: town; ground: root }
    MapNature { id: nature; ground: root }
    MapStreets { id: streets; ground: root }
}
