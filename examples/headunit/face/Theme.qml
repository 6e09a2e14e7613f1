pragma Singleton
import QtQuick 2.15

/** Colours, sizes and fonts of the face: dark, and readable from the driver's seat. */
QtObject {
    readonly property color background: "#0b0f14"
    readonly property color surface: "#151b23"
    readonly property color raised: "#1e2630"
    readonly property color pressed: "#2b3644"
    readonly property color line: "#2a3340"
    readonly property color text: "#f2f5f8"
    readonly property color secondary: "#9aa7b5"
    readonly property color disabled: "#5a6673"
    property color accent: "#3da9fc" ///< chosen by the driver, see Preferences
    readonly property color accentText: "#06121d" ///< text on accent, positive and warning
    readonly property color accentSoft: Qt.rgba(accent.r, accent.g, accent.b, 0.16)
    readonly property color positive: "#35c97c"
    readonly property color warning: "#ffb020"
    readonly property color critical: "#ff4d4f"

    readonly property string font: "Inter"
    readonly property string icons: "Material Icons"

    // Pixels of the 1280 x 720 display; nothing to be read is smaller than small.
    readonly property int small: 22
    readonly property int normal: 28
    readonly property int title: 40
    readonly property int huge: 84

    readonly property int margin: 32
    readonly property int gap: 16
    readonly property int radius: 18
    readonly property int row: 84 ///< the height of what a finger has to hit
}
