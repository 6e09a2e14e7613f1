import QtQuick 2.15
import "../.."
import "../../controls"

/** Something about a call that can be switched on and off. */
Card {
    id: root

    property string icon
    property string text
    property bool on: false

    width: (1120 - 3 * Theme.gap) / 4
    height: 124
    padding: 0
    touchable: true
    color: root.pressed ? Theme.pressed : root.on ? Theme.accentSoft : Theme.surface
    onClicked: root.on = !root.on

    Column {
        anchors.centerIn: parent
        spacing: 8

        Icon {
            anchors.horizontalCenter: parent.horizontalCenter
            name: root.icon
            size: 42
            color: root.on ? Theme.accent : Theme.text
        }
        Label {
            anchors.horizontalCenter: parent.horizontalCenter
            kind: Label.Small
            text: root.text
            color: root.on ? Theme.accent : Theme.text
        }
    }
}
