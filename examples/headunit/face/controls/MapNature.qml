import QtQml 2.15

/** Paints the greens and waters of a city. */
QtObject {
    id: root

    required property var ground

    function paint(ctx) {
        const colours = root.ground.colours, lines = root.ground.city.lines
        root.ground.city.parks.forEach(corners => root.paintPark(ctx, corners))
        root.ground.stroke(ctx, [lines.canal], 30, colours.shore)
        root.ground.stroke(ctx, [lines.river], 104, colours.shore)
        root.ground.stroke(ctx, [lines.canal], 26, colours.water)
        root.ground.stroke(ctx, [lines.river], 99, colours.water)
        root.paintLake(ctx, [[1800, 760], [1880, 750], [1910, 820], [1870, 880], [1810, 850]])
        root.paintLake(ctx, [[500, 770], [560, 790], [590, 840], [540, 850], [490, 820]])
    }

    function paintLake(ctx, corners) {
        root.ground.rounded(ctx, corners)
        ctx.fillStyle = root.ground.colours.water
        ctx.fill()
        ctx.lineWidth = 2
        ctx.strokeStyle = root.ground.colours.shore
        ctx.stroke()
    }

    // Paths lead from the corners to the middle, as people walk.
    function paintPark(ctx, corners) {
        root.ground.rounded(ctx, corners)
        ctx.fillStyle = root.ground.colours.park
        ctx.fill()
        ctx.save()
        ctx.clip()
        const x = corners.reduce((sum, c) => sum + c[0], 0) / corners.length
        const y = corners.reduce((sum, c) => sum + c[1], 0) / corners.length
        const paths = corners.map((c, i) => root.ground.city.curve(
            [c, [(c[0] + x) / 2 + (i % 2 ? 14 : -12), (c[1] + y) / 2 + (i % 2 ? -10 : 12)], [x, y]], false))
        root.ground.stroke(ctx, paths, 2.5, root.ground.colours.parkPath)
        ctx.restore()
    }
}
