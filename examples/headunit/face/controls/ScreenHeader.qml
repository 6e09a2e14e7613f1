import QtQuick 2.15
import HmiStateMachine 1.0
import ".."

/** The top of a screen: the way back when there is one, the title, and at the right what is put into it. */
Item {
    id: root

    property string title
    property string subtitle
    property bool backShown: ViewTarget.backPossible
    default property alias content: slot.data

    implicitHeight: 96
    implicitWidth: 1184

    TouchButton {
        id: back
        objectName: "button-back"
        anchors { left: parent.left; leftMargin: 24; verticalCenter: parent.verticalCenter }
        width: 72
        height: 72
        visible: root.backShown
        round: true
        icon: "arrow_back"
        onClicked: Requests.back()
    }
    Column {
        anchors {
            left: parent.left
            leftMargin: root.backShown ? 24 + back.width + 20 : Theme.margin
            right: slot.left
            rightMargin: Theme.gap
            verticalCenter: parent.verticalCenter
        }

        Label {
            objectName: "title"
            width: parent.width
            kind: Label.Title
            text: root.title
        }
        Label {
            width: parent.width
            visible: root.subtitle !== ""
            kind: Label.Small
            muted: true
            text: root.subtitle
        }
    }
    Row {
        id: slot
        anchors { right: parent.right; rightMargin: Theme.margin; verticalCenter: parent.verticalCenter }
        spacing: Theme.gap
    }
}
