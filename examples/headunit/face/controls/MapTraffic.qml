import QtQuick 2.15
import ".."

/** How the traffic flows: stretches of streets, slow ones and jams. */
Item {
    id: root

    property MapCity city
    property real zoom: 1
    property rect window ///< what is to be seen of the map

    // A street, from and to which of its samples, 0 flowing .. 2 jammed, and on which side.
    readonly property var stretches: [
        ["ring", 40, 50, 1, 1], ["ring", 50, 57, 2, 1], ["ring", 57, 64, 1, 1], ["ring", 22, 40, 0, 1],
        ["ring", 100, 118, 0, -1], ["ring", 118, 128, 1, -1], ["ring", 128, 136, 2, -1],
        ["south", 4, 10, 0, 1], ["south", 10, 18, 1, 1], ["south", 18, 24, 2, 1], ["south", 16, 29, 0, -1],
        ["east", 1, 9, 1, 1], ["east", 9, 16, 2, 1], ["east", 16, 28, 0, 1], ["east", 3, 14, 0, -1],
        ["west", 2, 9, 0, 1], ["west", 9, 15, 1, 1], ["harbour", 2, 12, 0, 1], ["harbour", 12, 22, 1, 1],
        ["station", 1, 7, 2, 1], ["station", 7, 12, 1, 1], ["station", 12, 26, 0, 1],
        ["north", 2, 8, 1, -1], ["north", 8, 18, 0, -1], ["orchard", 2, 9, 0, 1], ["wall", 42, 54, 1, 1]
    ]
    readonly property var flow: [Theme.positive, Theme.warning, Theme.critical]

    Repeater {
        model: root.stretches

        // The software renderer does not clip a shape that is outside altogether.
        MapLine {
            id: flowLine
            visible: flowLine.isIn(root.window)
            zoom: root.zoom
            thickness: modelData[3] === 0 ? 4.5 : 6.5
            colour: root.flow[modelData[3]]
            edge: "#0a0f15"
            edgeThickness: 1.5
            line: root.city.beside(root.city.lines[modelData[0]].slice(modelData[1], modelData[2] + 1),
                                   5 * modelData[4])
        }
    }
    Repeater {
        model: [[2016, 1000], [1140, 1010], [1020, 1078], [1630, 634]]

        Rectangle {
            x: modelData[0] * root.zoom - width / 2
            y: modelData[1] * root.zoom - height / 2
            width: 40
            height: 40
            radius: 20
            color: Theme.critical
            border { width: 3; color: "#ffffff" }

            Icon {
                anchors.centerIn: parent
                name: index === 2 ? "construction" : "priority_high"
                size: 24
            }
        }
    }
}
