import QtQuick 2.15
import ".."

/** The field on a map that leads to the search for a destination. */
Card {
    id: root

    objectName: "button-search-field"
    width: 440
    height: 84
    radius: 42
    padding: 0
    touchable: true

    Icon {
        anchors { left: parent.left; leftMargin: 28; verticalCenter: parent.verticalCenter }
        name: "search"
        size: 36
        color: Theme.accent
    }
    Label {
        objectName: "title"
        anchors { left: parent.left; leftMargin: 82; verticalCenter: parent.verticalCenter }
        text: "Where to?"
        color: Theme.secondary
    }
}
