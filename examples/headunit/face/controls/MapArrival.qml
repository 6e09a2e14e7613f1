import QtQuick 2.15
import ".."

/** When the driver will be there, how long that takes and how far it is. */
Card {
    id: root

    required property MapRoute route
    property bool delayed: false ///< there is a jam on the way

    readonly property var arrival: new Date(Date.now() + root.route.minutesLeft * 60000)

    signal stopped()

    width: 560
    height: 108
    padding: 0

    Row {
        anchors { left: parent.left; leftMargin: 28; verticalCenter: parent.verticalCenter }
        spacing: 30

        Repeater {
            model: [
                { value: Qt.formatTime(root.arrival, Preferences.clockFormat), unit: "arrival" },
                { value: root.route.minutesLeft, unit: "min" },
                { value: root.route.kilometresLeft.toFixed(1), unit: "km" }
            ]

            Column {
                Label {
                    text: modelData.value
                    color: index === 1 && root.delayed ? Theme.warning : Theme.text
                    font { pixelSize: 38; weight: Font.DemiBold }
                }
                Label { text: modelData.unit; kind: Label.Small; muted: true }
            }
        }
    }
    TouchButton {
        objectName: "button-stop"
        anchors { right: parent.right; rightMargin: 16; verticalCenter: parent.verticalCenter }
        width: 150
        height: 76
        icon: "close"
        text: "Stop"
        onClicked: root.stopped()
    }
}
