import QtQuick 2.15
import ".."
import "../controls"

/** A question: a card in the middle that wants an answer before anything else is done. */
PopupFrame {
    id: root

    property string icon: "help_outline"
    property color ink: Theme.accent
    property string title: root.read("title", "A question")
    property string text: root.read("text", "")
    property string yes: "OK"
    property string no: "Not now"

    signal accepted

    modal: true
    panelWidth: 760
    panelHeight: 392
    onAccepted: root.dismiss()

    Column {
        anchors.horizontalCenter: parent.horizontalCenter
        y: 36
        width: parent.width - 96
        spacing: 12

        PopupSign {
            anchors.horizontalCenter: parent.horizontalCenter
            icon: root.icon
            ink: root.ink
            size: 84
        }

        Label {
            objectName: "popup-title"
            width: parent.width
            topPadding: 8
            horizontalAlignment: Text.AlignHCenter
            text: root.title
            kind: Label.Title
        }

        Label {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            visible: text !== ""
            text: root.text
            muted: true
            wrapMode: Text.WordWrap
            maximumLineCount: 2
        }
    }

    PopupButtons {
        yes: root.yes
        no: root.no
        onAccepted: root.accepted()
        onDismissed: root.dismiss()
    }
}
