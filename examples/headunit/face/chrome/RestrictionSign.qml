import QtQuick 2.15
import ".."
import "../controls"

/** Whether the car is too fast for the driver to watch and type; a touch asks for the other. */
Column {
    id: root

    property bool active: false

    signal clicked

    width: 68
    spacing: 4

    Icon {
        anchors.horizontalCenter: parent.horizontalCenter
        name: root.active ? "lock" : "lock_open"
        size: 28
        color: root.active ? Theme.warning : Theme.disabled
    }

    PanelText {
        anchors.horizontalCenter: parent.horizontalCenter
        text: root.active ? "Driving" : "Free"
        color: root.active ? Theme.warning : Theme.secondary
    }

    TapHandler {
        onTapped: root.clicked()
    }
}
