import QtQuick 2.15
import HmiStateMachine 1.0
import ".."
import "../controls"
import "../views/Phone"
import "../views/Phone/chosen.js" as Chosen

/** Somebody calls while something else is on the screen. */
PopupFrame {
    id: root

    readonly property string told: root.read("caller", "")
    readonly property bool known: root.told !== "" && root.told !== "unknown"
    readonly property string caller: root.known ? book.caller(root.told).name : "Unknown caller"

    stateName: "phone/call"
    modal: true
    panelWidth: 760
    panelHeight: 432

    ContactBook {
        id: book
    }

    CallerPicture {
        id: picture

        anchors.horizontalCenter: parent.horizontalCenter
        y: 40
        caller: root.known ? root.caller : ""
    }

    Column {
        anchors.top: picture.bottom
        anchors.topMargin: 28
        anchors.horizontalCenter: parent.horizontalCenter
        width: parent.width - 96
        spacing: 4

        Label {
            objectName: "popup-title"
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            text: root.caller
            kind: Label.Title
        }

        Label {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            text: "Incoming call"
            muted: true
        }
    }

    Row {
        anchors {
            left: parent.left
            right: parent.right
            bottom: parent.bottom
            margins: Theme.margin
        }
        spacing: Theme.gap

        TouchButton {
            objectName: "dismiss"
            width: (parent.width - Theme.gap) / 2
            kind: TouchButton.Critical
            icon: "call_end"
            text: "Decline"
            onClicked: {
                root.dismiss();
                Requests.event("CallEnded");
            }
        }

        TouchButton {
            objectName: "accept"
            width: (parent.width - Theme.gap) / 2
            kind: TouchButton.Positive
            icon: "phone"
            text: "Accept"
            onClicked: {
                Chosen.caller = root.caller;
                Requests.view("Phone/InCall");
                root.dismiss();
            }
        }
    }
}
