import QtQuick 2.15
import ".."
import "../controls"

/** An overlay: a slim bar above the soft keys. A particular one fills it; else it has a text. */
PopupFrame {
    id: root

    property string icon: "info"
    property string text: root.read("text", "")
    property bool closable: true
    default property alias details: extra.data

    surface: Theme.raised
    radius: 28
    panelWidth: 760
    panelHeight: 96
    panelY: root.height - 80 - 20 - panelHeight

    PopupSign {
        id: sign

        x: 16
        anchors.verticalCenter: parent.verticalCenter
        size: 64
        icon: root.icon
        ink: Theme.accent
    }

    Label {
        objectName: "popup-title"
        anchors.fill: extra
        visible: text !== ""
        text: root.text
    }

    Item {
        id: extra

        anchors.left: sign.right
        anchors.leftMargin: 20
        anchors.right: parent.right
        anchors.rightMargin: root.closable ? 104 : Theme.margin
        height: parent.height
    }

    TouchButton {
        objectName: "dismiss"
        anchors.right: parent.right
        anchors.rightMargin: 6
        anchors.verticalCenter: parent.verticalCenter
        visible: root.closable
        kind: TouchButton.Flat
        icon: "close"
        round: true
        onClicked: root.dismiss()
    }
}
