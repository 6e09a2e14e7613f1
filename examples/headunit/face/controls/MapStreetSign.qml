import QtQuick 2.15
import ".."

/** The name of the street that the car is on. */
Card {
    id: root

    property string street

    width: name.width + 108
    height: 60
    padding: 0

    Icon {
        anchors { left: parent.left; leftMargin: 24; verticalCenter: parent.verticalCenter }
        name: "navigation"
        size: 28
        color: Theme.accent
    }
    Label {
        id: name
        anchors { left: parent.left; leftMargin: 72; verticalCenter: parent.verticalCenter }
        kind: Label.Small
        text: root.street
    }
}
