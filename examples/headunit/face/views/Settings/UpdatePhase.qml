import QtQuick 2.15
import "../.."
import "../../controls"

/** A step of the update: to come, going on or done. */
Row {
    id: root

    property string text
    property bool begun: false
    property bool done: false

    spacing: 18

    Icon {
        anchors.verticalCenter: parent.verticalCenter
        name: root.done ? "check_circle" : root.begun ? "radio_button_checked" : "radio_button_unchecked"
        size: 32
        color: root.done ? Theme.positive : root.begun ? Theme.accent : Theme.disabled
    }
    Label {
        text: root.text
        color: root.begun && !root.done ? Theme.text : Theme.secondary
        font.weight: root.begun && !root.done ? Font.Medium : Font.Normal
    }
}
