import QtQuick 2.15
import ".."
import "../controls"

/** A part of the side panel that can be folded. */
Column {
    id: root

    property string title
    property string note
    property bool folded: false
    default property alias content: inside.data

    objectName: "section-" + root.title

    MouseArea {
        objectName: "fold-" + root.title
        width: root.width
        height: 44
        onClicked: root.folded = !root.folded

        Rectangle {
            width: parent.width
            height: 1
            color: Theme.line
        }

        Icon {
            x: 12
            anchors.verticalCenter: parent.verticalCenter
            name: root.folded ? "chevron_right" : "expand_more"
            size: 24
            color: Theme.secondary
        }

        PanelText {
            x: 44
            anchors.verticalCenter: parent.verticalCenter
            text: root.title
            font.weight: Font.DemiBold
        }

        PanelText {
            anchors.right: parent.right
            anchors.rightMargin: 20
            anchors.verticalCenter: parent.verticalCenter
            text: root.note
            color: Theme.secondary
        }
    }

    Column {
        id: inside

        visible: !root.folded
        x: 44
        width: root.width - 64
        bottomPadding: 10
    }
}
