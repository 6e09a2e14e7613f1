import QtQml 2.15
import "MapPlace.js" as Place

/** The way home through the city, and where on it the car is. */
QtObject {
    id: root

    required property MapCity city
    property real travelled: Place.travelled ///< metres from the start

    readonly property var parts: [["west", 1, 0], ["south", 0, 3], ["harbour", 0, 3], ["ring", 6, 2],
                                  ["orchard", 2, 3]]
    readonly property string destination: "14 Orchard Way"
    readonly property var line: root.city.joined(root.parts)
    readonly property var distances: root.measured(root.line)
    readonly property real length: root.distances[root.distances.length - 1]

    // What there is to do at the end of each part.
    readonly property var turns: root.turnsOf([
        { icon: "turn_right", street: "Bridge Street" },
        { icon: "turn_left", street: "Harbour Street" },
        { icon: "turn_slight_left", street: "Ring Road" },
        { icon: "turn_right", street: "Orchard Way" },
        { icon: "sports_score", street: root.destination }
    ])
    readonly property var turn: root.turns.find(turn => turn.at > root.travelled) || root.turns[4]
    readonly property var afterwards: root.turns[root.turns.indexOf(root.turn) + 1]
    readonly property string street: root.turns.indexOf(root.turn) > 0
        ? root.turns[root.turns.indexOf(root.turn) - 1].street : "Mill Lane" ///< where the car is
    readonly property real distanceToTurn: Math.max(0, root.turn.at - root.travelled)

    // The plan leaves out most of the suburbs: the way is longer than it looks.
    readonly property real kilometresLeft: (root.length - root.travelled) * 0.0088
    readonly property int minutesLeft: Math.max(1, Math.round(root.kilometresLeft * 1.6))

    readonly property int index: root.indexAt(root.travelled)
    readonly property point position: root.placeAt(root.index, root.travelled)
    readonly property real heading: root.headingAt(root.index)

    /** Drives on; having arrived the car begins anew. */
    function drive(metres) {
        const next = root.travelled + metres
        Place.travelled = next < root.length ? next : 0
        root.look()
    }

    /** Looks where the car has come to meanwhile. */
    function look() {
        root.travelled = Place.travelled
    }

    function measured(line) {
        const distances = [0]
        for (let i = 1; i < line.length; ++i)
            distances.push(distances[i - 1] + Math.hypot(line[i].x - line[i - 1].x, line[i].y - line[i - 1].y))
        return distances
    }

    function turnsOf(descriptions) {
        let count = 0
        return descriptions.map((turn, i) => {
            count += Math.abs(root.parts[i][2] - root.parts[i][1]) * root.city.steps + 1
            return { icon: turn.icon, street: turn.street, at: root.distances[count - 1] }
        })
    }

    /** The last sample that has been passed. */
    function indexAt(distance) {
        let low = 0, high = root.distances.length - 2
        while (low < high) {
            const middle = Math.ceil((low + high) / 2)
            if (root.distances[middle] <= distance)
                low = middle
            else
                high = middle - 1
        }
        return low
    }

    function placeAt(i, distance) {
        const a = root.line[i], b = root.line[i + 1]
        const step = root.distances[i + 1] - root.distances[i]
        const t = step > 0 ? (distance - root.distances[i]) / step : 0
        return Qt.point(a.x + (b.x - a.x) * t, a.y + (b.y - a.y) * t)
    }

    // Looks a bit ahead and back, so that the arrow does not jerk from sample to sample.
    function headingAt(i) {
        const a = root.line[Math.max(0, i - 1)], b = root.line[Math.min(root.line.length - 1, i + 2)]
        return Math.atan2(b.x - a.x, a.y - b.y) * 180 / Math.PI
    }
}
