import QtQuick 2.15
import HmiStateMachine 1.0
import ".."
import "../controls"

/** Makes something happen to the car: raises an event or asks for a popup. */
MouseArea {
    id: root

    /** name, icon, text, and either event or popup; data goes with them. */
    property var entry: ({})

    objectName: "provoke-" + root.entry.name
    height: 74
    onClicked: {
        if (root.entry.popup) {
            Requests.popup(root.entry.popup, root.entry.data);
        } else {
            Requests.event(root.entry.event, root.entry.data);
        }
    }

    Rectangle {
        anchors.fill: parent
        radius: 12
        color: root.pressed ? Theme.pressed : Theme.raised
    }

    Icon {
        anchors.horizontalCenter: parent.horizontalCenter
        y: 10
        name: root.entry.icon
        size: 28
        color: root.entry.ink || Theme.secondary
    }

    PanelText {
        anchors.bottom: parent.bottom
        anchors.bottomMargin: 9
        width: parent.width
        horizontalAlignment: Text.AlignHCenter
        text: root.entry.text
    }
}
