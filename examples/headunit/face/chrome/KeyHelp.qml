import QtQuick 2.15
import ".."
import "../controls"

/** The list of the computer's keys that play the car; a touch anywhere closes it. */
MouseArea {
    id: root

    readonly property var entries: [
        { keys: ["H"], meaning: "Home key" },
        { keys: ["B", "Esc"], meaning: "Back key, held: all the way home" },
        { keys: ["P"], meaning: "Phone key: open, answer, hang up" },
        { keys: ["V"], meaning: "Volume key: mute" },
        { keys: ["1", "…", "5"], meaning: "Open a domain" },
        { keys: ["↑", "↓"], meaning: "Faster and slower by 10 km/h" },
        { keys: ["F2"], meaning: "Panels in and out" },
        { keys: ["F1"], meaning: "This list" }
    ]

    Rectangle {
        anchors.fill: parent
        color: Theme.background
        opacity: 0.8
    }

    Rectangle {
        anchors.centerIn: parent
        width: content.width + 2 * Theme.margin
        height: content.height + 2 * Theme.margin
        radius: Theme.radius
        color: Theme.surface
        border.color: Theme.line

        Column {
            id: content

            anchors.centerIn: parent
            width: 640
            spacing: 4

            Label {
                text: "Keyboard"
                kind: Label.Title
                bottomPadding: Theme.gap
            }

            Repeater {
                model: root.entries

                KeyHelpRow {
                    width: content.width
                    keys: model.modelData.keys
                    meaning: model.modelData.meaning
                }
            }
        }
    }
}
