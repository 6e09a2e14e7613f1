import QtQuick 2.15
import HmiStateMachine 1.0

Rectangle {
    id: question
    property var popupData
    color: "#c0000000"
    MouseArea { anchors.fill: parent } // the screen beneath is out of reach
    Panel {
        anchors { fill: parent; margins: 96 }
        color: "#1e2a38"; radius: 16
        title: "Turn " + question.popupData.eventData.name + " off?"
        Button { text: "Yes"; onClicked: { Requests.dismiss("TurnOff"); Requests.view("Home") } }
        Button { text: "No"; onClicked: Requests.dismiss("TurnOff") }
    }
}
