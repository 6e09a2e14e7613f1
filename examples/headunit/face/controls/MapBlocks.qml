import QtQml 2.15

/** Paints the districts of a city: their buildings and lanes. */
QtObject {
    id: root

    required property var ground

    readonly property real detail: 0.6 ///< below this zoom there are no buildings

    function paint(ctx) {
        root.ground.city.districts.forEach(district => root.paintDistrict(ctx, district))
    }

    function paintDistrict(ctx, district) {
        const border = root.ground.city.joined(district.edge)
        ctx.save()
        ctx.beginPath()
        root.ground.trace(ctx, border)
        ctx.closePath()
        ctx.clip()
        if (district.grid[3] > 0.7) {
            ctx.fillStyle = root.ground.colours.town
            ctx.fill()
        }
        const blocks = root.blocksOf(border, district.grid)
        if (root.ground.zoom > root.detail)
            blocks.forEach(block => root.paintBuildings(ctx, block, district.grid[3]))
        root.paintLanes(ctx, blocks)
        ctx.restore()
    }

    // Corners stand a bit beside where a ruler would put them.
    function blocksOf(border, grid) {
        const xs = border.map(p => p.x), ys = border.map(p => p.y)
        const middle = Qt.point((Math.min(...xs) + Math.max(...xs)) / 2, (Math.min(...ys) + Math.max(...ys)) / 2)
        const reach = Math.hypot(Math.max(...xs) - middle.x, Math.max(...ys) - middle.y)
        const columns = Math.ceil(reach / grid[1]), rows = Math.ceil(reach / grid[2])
        const cos = Math.cos(grid[0] * Math.PI / 180), sin = Math.sin(grid[0] * Math.PI / 180)
        const corners = []
        for (let r = -rows; r <= rows; ++r) {
            for (let c = -columns; c <= columns; ++c) {
                const u = (c + (root.ground.chance() - 0.5) * 0.22) * grid[1]
                const v = (r + (root.ground.chance() - 0.5) * 0.22) * grid[2]
                corners.push(Qt.point(middle.x + u * cos - v * sin, middle.y + u * sin + v * cos))
            }
        }
        const blocks = [], wide = 2 * columns + 1
        for (let r = 0; r < 2 * rows; ++r) {
            for (let c = 0; c < 2 * columns; ++c) {
                const i = r * wide + c
                const quad = [corners[i], corners[i + 1], corners[i + wide + 1], corners[i + wide]]
                const open = root.ground.chance()
                if (root.ground.visibleAt(quad[0], 200) && quad.some(p => root.ground.inside(p, border)))
                    blocks.push({ quad: quad, open: open, main: r % 4 === 1, cross: c % 4 === 2 })
            }
        }
        return blocks
    }

    function paintLanes(ctx, blocks) {
        const top = b => [b.quad[0], b.quad[1]], left = b => [b.quad[0], b.quad[3]]
        const far = root.ground.zoom <= root.detail
        const lanes = blocks.filter(b => b.open > 0.12).map(top).concat(blocks.filter(b => b.open < 0.84).map(left))
        root.ground.stroke(ctx, lanes, far ? 3.5 : 6, root.ground.colours.lane)
        const wide = blocks.filter(b => b.main).map(top).concat(blocks.filter(b => b.cross).map(left))
        root.ground.stroke(ctx, wide, far ? 6 : 9, root.ground.colours.street)
    }

    // Two rows of houses back to back, with gardens and gaps between them.
    function paintBuildings(ctx, block, share) {
        const q = block.quad
        const at = (u, v) => Qt.point((q[0].x * (1 - u) + q[1].x * u) * (1 - v) + (q[3].x * (1 - u) + q[2].x * u) * v,
                                      (q[0].y * (1 - u) + q[1].y * u) * (1 - v) + (q[3].y * (1 - u) + q[2].y * u) * v)
        ctx.beginPath()
        for (let side = 0; side < 2; ++side) {
            let u = 0.1
            while (u < 0.84) {
                const length = Math.min(0.9 - u, 0.1 + root.ground.chance() * 0.2)
                const depth = 0.18 + root.ground.chance() * 0.16
                if (root.ground.chance() < share) {
                    const v0 = side ? 0.86 - depth : 0.14, v1 = side ? 0.86 : 0.14 + depth
                    root.ground.trace(ctx, [at(u, v0), at(u + length, v0), at(u + length, v1), at(u, v1)])
                    ctx.closePath()
                }
                u += length + (share > 0.7 ? 0.025 : 0.07)
            }
        }
        ctx.fillStyle = root.ground.colours.building
        ctx.fill()
    }
}
