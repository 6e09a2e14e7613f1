import QtQml 2.15

/** Paints the streets of a city, the important ones over the others. */
QtObject {
    id: root

    required property var ground

    function paint(ctx) {
        const city = root.ground.city, colours = root.ground.colours, lines = city.lines
        const banks = city.joined([["river", 2, 8]])
        const quays = [city.beside(banks, 62), city.beside(banks, -62)]
        const streets = [lines.orchard, lines.college, lines.vine, lines.linden, lines.wall]
        const avenues = [lines.north, lines.east, lines.west, lines.south, lines.station, lines.harbour]
        const grow = root.ground.zoom > 0.6 ? 1 : 1.25 // what is far away must still be seen

        root.paintRailway(ctx, lines.railway)
        root.paintClass(ctx, quays, 9, grow, colours.street)
        root.paintClass(ctx, streets, 12, grow, colours.avenue)
        root.paintClass(ctx, avenues, 15, grow, colours.avenue)
        root.paintClass(ctx, [lines.ring], 20, grow, colours.motorway)
        root.ground.stroke(ctx, [lines.ring], 1.6, colours.casing)
        root.paintSquare(ctx)
    }

    function paintClass(ctx, lines, width, grow, colour) {
        root.ground.stroke(ctx, lines, (width + 5) * grow, root.ground.colours.casing)
        root.ground.stroke(ctx, lines, width * grow, colour)
    }

    function paintRailway(ctx, line) {
        const colours = root.ground.colours
        root.ground.stroke(ctx, [line], 5, colours.railway)
        const sleepers = []
        for (let i = 0; i + 1 < line.length; ++i) {
            for (const t of [0.1, 0.5]) {
                const a = line[i], b = line[i + 1]
                sleepers.push([{ x: a.x + (b.x - a.x) * t, y: a.y + (b.y - a.y) * t },
                               { x: a.x + (b.x - a.x) * (t + 0.22), y: a.y + (b.y - a.y) * (t + 0.22) }])
            }
        }
        root.ground.stroke(ctx, sleepers, 2.4, colours.town)
    }

    // The roundabout in the middle of the town, and the houses that everybody knows.
    function paintSquare(ctx) {
        const colours = root.ground.colours
        ctx.fillStyle = colours.casing
        ctx.beginPath(); ctx.arc(1150, 640, 33, 0, 2 * Math.PI); ctx.fill()
        ctx.fillStyle = colours.avenue
        ctx.beginPath(); ctx.arc(1150, 640, 30, 0, 2 * Math.PI); ctx.fill()
        ctx.fillStyle = colours.park
        ctx.beginPath(); ctx.arc(1150, 640, 16, 0, 2 * Math.PI); ctx.fill()
        ctx.fillStyle = colours.landmark
        ctx.beginPath()
        root.ground.trace(ctx, [{ x: 1245, y: 690 }, { x: 1300, y: 686 }, { x: 1303, y: 726 }, { x: 1248, y: 730 }])
        ctx.closePath()
        root.ground.trace(ctx, [{ x: 1010, y: 1130 }, { x: 1105, y: 1147 }, { x: 1100, y: 1172 }, { x: 1006, y: 1155 }])
        ctx.closePath()
        ctx.fill()
    }
}
