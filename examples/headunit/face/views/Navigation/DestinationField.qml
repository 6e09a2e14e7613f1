import QtQuick 2.15
import "../.."
import "../../controls"

/** What has been typed, with a cursor, and a way to begin again. */
Rectangle {
    id: root

    property string text

    signal cleared()

    height: 76
    radius: 38
    color: Theme.surface
    border { width: 2; color: Theme.accent }

    Icon {
        anchors { left: parent.left; leftMargin: 26; verticalCenter: parent.verticalCenter }
        name: "search"
        color: Theme.accent
    }
    Label {
        id: label
        objectName: "title"
        anchors { left: parent.left; leftMargin: 78; verticalCenter: parent.verticalCenter }
        text: root.text
        textFormat: Text.PlainText
    }
    Label {
        anchors { left: parent.left; leftMargin: 86; verticalCenter: parent.verticalCenter }
        visible: root.text === ""
        muted: true
        text: "Street, place or postcode"
    }
    Rectangle {
        anchors.verticalCenter: parent.verticalCenter
        x: label.x + label.width + 2
        width: 3
        height: 38
        color: Theme.accent

        SequentialAnimation on opacity {
            loops: Animation.Infinite
            PauseAnimation { duration: 500 }
            PropertyAction { value: 0 }
            PauseAnimation { duration: 500 }
            PropertyAction { value: 1 }
        }
    }
    TouchButton {
        objectName: "button-clear"
        anchors { right: parent.right; rightMargin: 2; verticalCenter: parent.verticalCenter }
        visible: root.text !== ""
        width: 72
        height: 72
        round: true
        kind: TouchButton.Flat
        icon: "close"
        onClicked: root.cleared()
    }
}
