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
    function cornersOf(border, grid) {
        const xs = border.map(p => p.x), ys = border.map(p => p.y)
        const left = Math.min(...xs), right = Math.max(...xs), top = Math.min(...ys), bottom = Math.max(...ys)
        const middle = { x: (left + right) / 2, y: (top + bottom) / 2 }
        const reach = Math.hypot(right - middle.x, bottom - middle.y)
        const columns = Math.ceil(reach / grid[1]), rows = Math.ceil(reach / grid[2])
        const cos = Math.cos(grid[0] * Math.PI / 180), sin = Math.sin(grid[0] * Math.PI / 180)
        const lines = []
        for (let r = -rows; r <= rows; ++r) {
            const line = []
            for (let c = -columns; c <= columns; ++c) {
                const u = (c + (root.ground.chance() - 0.5) * 0.22) * grid[1]
                const v = (r + (root.ground.chance() - 0.5) * 0.22) * grid[2]
                const corner = { x: middle.x + u * cos - v * sin, y: middle.y + u * sin + v * cos }
                corner.inside = corner.x > left && corner.x < right && corner.y > top && corner.y < bottom
                                && root.ground.visibleAt(corner, 200) && root.ground.inside(corner, border)
                line.push(corner)
            }
            lines.push(line)
        }
        return lines
    }

    function blocksOf(border, grid) {
        const lines = root.cornersOf(border, grid), blocks = []
        for (let r = 0; r + 1 < lines.length; ++r) {
            for (let c = 0; c + 1 < lines[r].length; ++c) {
                const quad = [lines[r][c], lines[r][c + 1], lines[r + 1][c + 1], lines[r + 1][c]]
                const open = root.ground.chance()
                if (quad.some(corner => corner.inside))
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
        const between = (a, b, t) => ({ x: a.x + (b.x - a.x) * t, y: a.y + (b.y - a.y) * t })
        const at = (u, v) => between(between(q[0], q[1], u), between(q[3], q[2], u), v)
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
