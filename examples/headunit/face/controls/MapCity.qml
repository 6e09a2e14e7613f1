import QtQml 2.15

/**
 * The plan of an invented city, in metres. Streets are curves through the points where they meet
 * others, so that routes and the borders of districts can be put together from pieces of them.
 */
QtObject {
    id: root

    readonly property int width: 2400
    readonly property int height: 1500
    readonly property int steps: 10 ///< samples from one point of a street to the next

    readonly property var points: ({
        ring: [[1150, 190], [1540, 200], [1880, 360], [2050, 660], [2030, 880], [1950, 1075],
               [1820, 1230], [1560, 1340], [1140, 1375], [740, 1310], [440, 1110], [300, 800],
               [300, 490], [430, 310], [740, 215]],
        river: [[-80, 420], [100, 430], [300, 490], [520, 620], [760, 800], [1150, 885],
                [1400, 850], [1680, 900], [1950, 1075], [2200, 1190], [2480, 1200]],
        canal: [[1680, 900], [1715, 770], [1700, 640], [1640, 430], [1660, 250], [1720, 80],
                [1700, -60]],
        north: [[1150, 640], [1150, 420], [1150, 190], [1175, 60], [1170, -60]],
        east: [[1150, 640], [1420, 620], [1700, 640], [2050, 660], [2250, 620], [2480, 640]],
        west: [[1150, 640], [860, 600], [620, 440], [430, 310], [200, 210], [-80, 80]],
        south: [[1150, 640], [1165, 770], [1150, 885], [1140, 1100], [1140, 1375], [1150, 1560]],
        station: [[1140, 1100], [860, 1060], [600, 950], [300, 800], [100, 770], [-80, 780]],
        harbour: [[1140, 1100], [1430, 1080], [1640, 1120], [1820, 1230], [2100, 1340],
                  [2480, 1400]],
        orchard: [[1420, 620], [1640, 430], [1880, 360], [2150, 200], [2480, 110]],
        college: [[1150, 420], [940, 330], [740, 215], [580, 60], [540, -60]],
        vine: [[860, 1060], [880, 1200], [740, 1310], [640, 1560]],
        linden: [[1430, 1080], [1490, 1220], [1560, 1340], [1640, 1560]],
        wall: [[860, 600], [960, 450], [1150, 420], [1340, 470], [1420, 620], [1370, 755],
               [1165, 770], [960, 740], [860, 600]],
        railway: [[-80, 1010], [300, 1000], [600, 1080], [820, 1150], [1140, 1190], [1500, 1150],
                  [1760, 1110], [2060, 960], [2480, 900]]
    })

    /** Pieces, then how its lanes run: [angle, length and depth of a block, share of buildings]. */
    readonly property var districts: [
        { edge: [["north", 0, 2], ["ring", 0, 2], ["orchard", 2, 0], ["east", 1, 0]], grid: [4, 92, 62, 0.9] },
        { edge: [["orchard", 0, 2], ["ring", 2, 3], ["east", 3, 1]], grid: [-28, 100, 66, 0.8] },
        { edge: [["east", 0, 3], ["ring", 3, 5], ["river", 8, 5], ["south", 2, 0]], grid: [8, 88, 60, 0.9] },
        { edge: [["south", 0, 2], ["river", 5, 2], ["ring", 12, 13], ["west", 3, 0]], grid: [32, 90, 60, 0.88] },
        { edge: [["west", 0, 3], ["ring", 13, 14], ["college", 2, 0], ["north", 1, 0]], grid: [26, 86, 60, 0.9] },
        { edge: [["college", 0, 2], ["ring", 14, 15], ["north", 2, 1]], grid: [-4, 96, 60, 0.85] },
        { edge: [["south", 2, 3], ["harbour", 0, 3], ["ring", 6, 5], ["river", 8, 5]], grid: [14, 118, 72, 0.8] },
        { edge: [["south", 3, 4], ["ring", 8, 7], ["linden", 2, 0], ["harbour", 1, 0]], grid: [-2, 92, 64, 0.88] },
        { edge: [["linden", 0, 2], ["ring", 7, 6], ["harbour", 3, 1]], grid: [24, 90, 64, 0.8] },
        { edge: [["south", 2, 3], ["station", 0, 3], ["ring", 11, 12], ["river", 2, 5]], grid: [22, 94, 62, 0.88] },
        { edge: [["station", 1, 3], ["ring", 11, 9], ["vine", 2, 0]], grid: [30, 104, 66, 0.8] },
        { edge: [["station", 0, 1], ["vine", 0, 2], ["ring", 9, 8], ["south", 4, 3]], grid: [6, 90, 60, 0.88] },
        { edge: [["north", 2, 4], [2480, -60], ["orchard", 4, 2], ["ring", 2, 0]], grid: [-14, 126, 84, 0.5] },
        { edge: [["orchard", 2, 4], ["east", 5, 3], ["ring", 3, 2]], grid: [-22, 130, 84, 0.5] },
        { edge: [["east", 3, 5], ["river", 10, 8], ["ring", 5, 3]], grid: [12, 122, 88, 0.5] },
        { edge: [["river", 8, 10], ["harbour", 5, 3], ["ring", 6, 5]], grid: [20, 150, 90, 0.6] },
        { edge: [["harbour", 3, 5], [2480, 1560], ["linden", 3, 2], ["ring", 7, 6]], grid: [16, 130, 84, 0.5] },
        { edge: [["linden", 2, 3], ["south", 5, 4], ["ring", 8, 7]], grid: [-4, 120, 80, 0.5] },
        { edge: [["south", 4, 5], ["vine", 3, 2], ["ring", 9, 8]], grid: [6, 124, 80, 0.5] },
        { edge: [["vine", 2, 3], [-80, 1560], ["station", 5, 3], ["ring", 11, 9]], grid: [34, 128, 86, 0.45] },
        { edge: [["station", 3, 5], ["river", 0, 2], ["ring", 12, 11]], grid: [4, 122, 80, 0.5] },
        { edge: [["river", 2, 0], ["west", 5, 3], ["ring", 13, 12]], grid: [24, 122, 80, 0.5] },
        { edge: [["west", 3, 5], [-80, -60], ["college", 4, 2], ["ring", 14, 13]], grid: [30, 128, 84, 0.45] },
        { edge: [["college", 2, 4], ["north", 4, 2], ["ring", 15, 14]], grid: [-6, 126, 82, 0.5] }
    ]

    /** Corners of the greens; the corners are rounded when they are painted. */
    readonly property var parks: [
        [[1195, 680], [1330, 668], [1362, 730], [1330, 752], [1200, 752]],
        [[1760, 690], [1930, 700], [1990, 800], [1960, 950], [1830, 935], [1745, 840]],
        [[470, 700], [600, 770], [690, 850], [640, 925], [500, 870], [380, 800], [400, 700]],
        [[560, 250], [720, 255], [820, 330], [780, 400], [650, 410], [540, 345]],
        [[1500, 250], [1610, 280], [1600, 400], [1490, 410], [1420, 330]],
        [[1180, 920], [1350, 900], [1440, 925], [1400, 985], [1200, 985]],
        [[20, 860], [200, 850], [260, 950], [180, 960], [20, 950]],
        [[2150, 780], [2400, 740], [2400, 880], [2200, 930], [2120, 860]],
        [[1290, 20], [1500, 0], [1600, 90], [1480, 150], [1300, 130]]
    ]

    readonly property var lines: root.sampled()

    /** A curve through the points. */
    function curve(corners, closed) {
        const n = corners.length, line = [], last = closed ? n : n - 1
        const at = i => closed ? corners[(i + n) % n] : corners[Math.max(0, Math.min(n - 1, i))]
        const mix = (a, b, c, d, t) => 0.5 * (2 * b + (c - a) * t + (2 * a - 5 * b + 4 * c - d) * t * t
                                              + (3 * b - a - 3 * c + d) * t * t * t)
        for (let i = 0; i < last; ++i) {
            const a = at(i - 1), b = at(i), c = at(i + 1), d = at(i + 2)
            for (let s = 0; s < root.steps; ++s) {
                const t = s / root.steps
                line.push({ x: mix(a[0], b[0], c[0], d[0], t), y: mix(a[1], b[1], c[1], d[1], t) })
            }
        }
        const end = at(last)
        line.push({ x: end[0], y: end[1] })
        return line
    }

    function sampled() {
        const lines = {}
        for (const name in root.points)
            lines[name] = root.curve(root.points[name], name === "ring")
        return lines
    }

    /** The samples of a street between two of its points; a single corner is itself. */
    function piece(part) {
        if (typeof part[0] === "number")
            return [{ x: part[0], y: part[1] }]
        const from = part[1] * root.steps, to = part[2] * root.steps
        const line = root.lines[part[0]].slice(Math.min(from, to), Math.max(from, to) + 1)
        return from <= to ? line : line.reverse()
    }

    function joined(parts) {
        return parts.reduce((all, part) => all.concat(root.piece(part)), [])
    }

    /** The line beside a line, to the right of it. */
    function beside(line, distance) {
        return line.map((p, i) => {
            const a = line[Math.max(0, i - 1)], b = line[Math.min(line.length - 1, i + 1)]
            const length = Math.hypot(b.x - a.x, b.y - a.y)
            return { x: p.x - (b.y - a.y) / length * distance, y: p.y + (b.x - a.x) / length * distance }
        })
    }
}
