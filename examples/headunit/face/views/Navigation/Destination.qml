import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"

/** Where the driver types where to go, and is offered what begins like that. */
Page {
    id: root

    property string typed: ""
    readonly property var found: places.matching(root.typed, 3)

    function search(text) {
        Requests.event("ResultsFound", { results: 3, query: text })
    }

    // As a name is written, with capitals at the beginning of its words.
    function append(text) {
        const begins = root.typed === "" || root.typed.endsWith(" ")
        if (root.typed.length < 28)
            root.typed += begins ? text : text.toLowerCase()
    }

    Places { id: places }

    TouchButton {
        id: back
        objectName: "button-back"
        x: 24
        y: 12
        width: 72
        height: 72
        visible: ViewTarget.backPossible
        round: true
        icon: "arrow_back"
        onClicked: Requests.back()
    }
    DestinationField {
        anchors { left: parent.left; leftMargin: back.visible ? 116 : Theme.margin; right: parent.right; rightMargin: Theme.margin }
        y: 10
        text: root.typed
        onCleared: root.typed = ""
    }
    Row {
        x: Theme.margin
        y: 104
        spacing: Theme.gap

        Repeater {
            model: root.found

            Suggestion {
                readonly property var place: places.get(modelData)
                objectName: "suggestion-" + index
                width: (1120 - 2 * Theme.gap) / 3
                icon: place.icon
                title: place.name
                subtitle: place.detail
                onClicked: root.search(place.name)
            }
        }
    }
    Label {
        x: Theme.margin
        y: 134
        visible: root.found.length === 0
        muted: true
        text: "Nothing nearby begins like that. Search to look further away."
    }
    Keyboard {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; leftMargin: Theme.margin; rightMargin: Theme.margin; bottomMargin: 22 }
        onTyped: root.append(text)
        onErased: root.typed = root.typed.slice(0, -1)
        onSearched: root.search(root.typed)
    }
}
