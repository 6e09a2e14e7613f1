import QtQuick 2.15
import ".."

/** What the colours of the traffic mean. */
Card {
    id: root

    width: entries.width + 48
    height: 60
    padding: 0

    Row {
        id: entries
        anchors.centerIn: parent
        spacing: 28

        Repeater {
            model: [
                { name: "Flowing", colour: Theme.positive },
                { name: "Slow", colour: Theme.warning },
                { name: "Jam", colour: Theme.critical }
            ]

            Row {
                spacing: 12

                Rectangle {
                    anchors.verticalCenter: parent.verticalCenter
                    width: 28
                    height: 8
                    radius: 4
                    color: modelData.colour
                }
                Label { text: modelData.name; kind: Label.Small }
            }
        }
    }
}
