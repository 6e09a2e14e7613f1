import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"

/** The dark display: the time and nothing else, until it is touched. */
Page {
    id: root

    color: "#000000"

    Clock { id: clock }

    Column {
        anchors.centerIn: parent
        opacity: 0.55

        Label {
            objectName: "title"
            anchors.horizontalCenter: parent.horizontalCenter
            kind: Label.Huge
            text: clock.time
            font.pixelSize: 160
            font.weight: Font.Thin
            font.letterSpacing: -6
        }
        Label {
            anchors.horizontalCenter: parent.horizontalCenter
            muted: true
            text: clock.date
        }
    }
    Label {
        anchors { horizontalCenter: parent.horizontalCenter; bottom: parent.bottom; bottomMargin: 32 }
        kind: Label.Small
        color: Theme.disabled
        text: "Touch to wake"
    }
    MouseArea {
        objectName: "button-wake"
        anchors.fill: parent
        onClicked: Requests.view("Home/Main")
    }
}
