pragma Singleton
import QtQuick 2.15
import "."

/** What the driver has set; nothing of it outlives the program. */
QtObject {
    id: root

    property real brightness: 0.8 ///< 0..1; the face dims itself by it
    property color accent: root.accents[0].color
    property bool nightMap: true
    property bool use24h: true
    property real balance: 0 ///< -1 left .. 1 right
    property real fader: 0 ///< -1 rear .. 1 front
    property real bass: 0.6
    property real treble: 0.5
    property bool keyTones: true
    property string language: "en"
    property string driver: "Mara"

    readonly property var accents: [
        { name: "Glacier", color: "#3da9fc" },
        { name: "Fern", color: "#4ccf9a" },
        { name: "Amber", color: "#f5b14c" },
        { name: "Coral", color: "#ff8a70" },
        { name: "Iris", color: "#a99bff" }
    ]
    readonly property string clockFormat: root.use24h ? "hh:mm" : "h:mm AP"

    onAccentChanged: Theme.accent = root.accent
}
