import QtQuick 2.15
import ".."
import "../controls"

/** The two answers along the lower edge of a card. */
Row {
    id: root

    property string yes
    property string no
    readonly property real share: root.yes === "" ? root.width : (root.width - root.spacing) / 2

    signal accepted
    signal dismissed

    anchors {
        left: parent.left
        right: parent.right
        bottom: parent.bottom
        margins: Theme.margin
    }
    height: Theme.row
    spacing: Theme.gap

    TouchButton {
        objectName: "dismiss"
        width: root.share
        height: root.height
        text: root.no
        onClicked: root.dismissed()
    }

    TouchButton {
        objectName: "accept"
        visible: root.yes !== ""
        width: root.share
        height: root.height
        kind: TouchButton.Primary
        text: root.yes
        onClicked: root.accepted()
    }
}
