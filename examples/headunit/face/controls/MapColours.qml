import QtQuick 2.15
import ".."

/** The colours of the map: dark at night, paper by day. */
QtObject {
    id: root

    property bool night: true

    readonly property color land: root.night ? "#0d131a" : "#ebe9e2"
    readonly property color town: root.night ? "#131c26" : "#e3e0d8"
    readonly property color building: root.night ? "#1e2936" : "#d3cfc5"
    readonly property color landmark: root.night ? "#2c3a4b" : "#c3b8a4"
    readonly property color park: root.night ? "#10291f" : "#c5dfb6"
    readonly property color parkPath: root.night ? "#1f4435" : "#e3efd9"
    readonly property color water: root.night ? "#0d2b47" : "#a5d0ec"
    readonly property color shore: root.night ? "#15406a" : "#8bbddd"
    readonly property color railway: root.night ? "#3a4653" : "#a9a49a"
    readonly property color casing: root.night ? "#0a0f15" : "#c4beb1"
    readonly property color lane: root.night ? "#2a3543" : "#fbfaf7"
    readonly property color street: root.night ? "#35424f" : "#ffffff"
    readonly property color avenue: root.night ? "#4d5d70" : "#ffffff"
    readonly property color motorway: root.night ? "#8d7746" : "#f6c368"
    readonly property color label: root.night ? "#c6d1dc" : "#2c3843"
    readonly property color district: root.night ? "#7e8c9c" : "#7b7568"
    readonly property color waterLabel: root.night ? "#4f8fc4" : "#2f74a8"
    readonly property color halo: root.night ? "#0b1016" : "#f8f7f3"
    readonly property color routeEdge: Qt.darker(Theme.accent, root.night ? 2.6 : 1.8)
}
