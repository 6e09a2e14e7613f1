import QtQuick 2.15
import ".."

/** The names on a map, each along its street, and the signs of places that drivers look for. */
Item {
    id: root

    property MapCity city
    property MapColours colours
    property real zoom: 1

    // A street, where on it, its name, and from which zoom on it is worth its space.
    readonly property var streets: [
        ["north", 14.2, "Northgate", 0.6], ["east", 15, "Eastern Avenue", 0.6], ["west", 14, "Mill Lane", 0.6],
        ["south", 36, "Bridge Street", 0.6], ["station", 14, "Station Road", 0.6],
        ["harbour", 15.4, "Harbour Street", 0.6], ["orchard", 15, "Orchard Way", 0.6],
        ["college", 15, "College Road", 0.6], ["vine", 6, "Vine Street", 0.6],
        ["linden", 8, "Linden Avenue", 0.6], ["wall", 13.6, "Old Wall", 0.6],
        ["ring", 4, "Ring Road", 0.3], ["ring", 34.5, "Ring Road", 0.3], ["ring", 73, "Ring Road", 0.3],
        ["ring", 102, "Ring Road", 0.3], ["station", 37, "Station Road", 0.9],
        ["east", 42, "Eastern Avenue", 0.9], ["harbour", 36, "Harbour Street", 0.9]
    ]
    readonly property var districts: [
        ["OLD TOWN", 1010, 520], ["NORTHFIELD", 1330, 340], ["MILLSIDE", 640, 560], ["HARBOUR", 1560, 1010],
        ["EASTMERE", 1890, 540], ["STATION QUARTER", 960, 1240], ["LINDEN HILL", 1330, 1240],
        ["ORCHARDS", 2200, 400], ["WESTBANK", 520, 1010], ["COLLEGE", 960, 265]
    ]
    readonly property var places: [
        ["museum", 1275, 708, "#b78df7"], ["train", 1056, 1151, "#6fb1ff"], ["local_parking", 1062, 706, "#3d8bfd"],
        ["local_gas_station", 1300, 1040, "#f0a13a"], ["local_cafe", 910, 680, "#d9936a"],
        ["park", 1800, 900, "#4fb477"], ["ev_station", 1510, 690, "#3fbf9b"], ["local_parking", 1240, 560, "#3d8bfd"],
        ["hotel", 1330, 800, "#e08bb0"], ["local_gas_station", 690, 660, "#f0a13a"], ["park", 690, 310, "#4fb477"]
    ]

    Repeater {
        model: root.districts

        Text {
            x: modelData[1] * root.zoom - width / 2
            y: modelData[2] * root.zoom - height / 2
            visible: root.zoom >= 0.6
            text: modelData[0]
            color: root.colours.district
            font { family: Theme.font; pixelSize: Theme.small; weight: Font.DemiBold; letterSpacing: 4 }
            style: Text.Outline
            styleColor: root.colours.halo
        }
    }
    Repeater {
        model: [["river", 35.5], ["river", 62], ["river", 88]]

        MapStreetName {
            line: root.city.lines[modelData[0]]
            at: modelData[1]
            zoom: root.zoom
            text: "River Alder"
            color: root.colours.waterLabel
            styleColor: root.colours.water
            font.italic: true
            font.letterSpacing: 3
        }
    }
    Repeater {
        model: root.streets

        MapStreetName {
            line: root.city.lines[modelData[0]]
            at: modelData[1]
            zoom: root.zoom
            visible: root.zoom >= modelData[3]
            text: modelData[2]
            color: root.colours.label
            styleColor: root.colours.halo
        }
    }
    Repeater {
        model: root.places

        Rectangle {
            x: modelData[1] * root.zoom - width / 2
            y: modelData[2] * root.zoom - height / 2
            visible: root.zoom >= 0.6
            width: 34
            height: 34
            radius: 17
            color: modelData[3]
            border { width: 2; color: root.colours.halo }

            Icon {
                anchors.centerIn: parent
                name: modelData[0]
                size: 20
                color: "#ffffff"
            }
        }
    }
}
