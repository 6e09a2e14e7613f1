import QtQuick 2.15
import ".."
import "../controls"

/** A warning: a card with an amber edge. What a particular one adds stands between text and buttons. */
PopupFrame {
    id: root

    property string icon: "warning"
    property string title: root.read("title", "Warning")
    property string text: root.read("text", "")
    property string yes
    property string no: "OK"
    default property alias details: extra.data

    signal accepted

    modal: true
    scrim: 0.6
    stripe: Theme.warning
    panelWidth: 760
    panelHeight: 176 + Theme.row + Theme.margin + (extra.childrenRect.height > 0 ? extra.childrenRect.height + 28 : 0)
    onAccepted: root.dismiss()

    PopupSign {
        id: sign

        x: 42
        y: 40
        size: 96
        icon: root.icon
        ink: Theme.warning
    }

    Column {
        id: words

        anchors.left: sign.right
        anchors.leftMargin: 28
        anchors.right: parent.right
        anchors.rightMargin: Theme.margin
        anchors.verticalCenter: sign.verticalCenter
        spacing: 6

        Label {
            objectName: "popup-title"
            width: parent.width
            text: root.title
            kind: Label.Title
        }

        Label {
            width: parent.width
            visible: text !== ""
            text: root.text
            muted: true
            wrapMode: Text.WordWrap
            maximumLineCount: 2
        }
    }

    Item {
        id: extra

        x: 42
        width: parent.width - 42 - Theme.margin
        anchors.top: sign.bottom
        anchors.topMargin: 28
    }

    PopupButtons {
        yes: root.yes
        no: root.no
        onAccepted: root.accepted()
        onDismissed: root.dismiss()
    }
}
