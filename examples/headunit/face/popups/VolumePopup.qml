import QtQuick 2.15
import ".."
import "../controls"

/** How loud it is, for a moment; at the top, where it hides no button of a call. */
OverlayPopup {
    id: root

    readonly property int level: Number(root.read("level", 0))
    readonly property int maximum: Math.max(1, Number(root.read("max", 20)))

    panelY: 8
    panelHeight: 112
    icon: root.level === 0 ? "volume_off" : root.level * 2 < root.maximum ? "volume_down" : "volume_up"

    ProgressBar {
        anchors.left: parent.left
        anchors.right: number.left
        anchors.verticalCenter: parent.verticalCenter
        height: 14
        value: root.level / root.maximum
    }

    Label {
        id: number

        objectName: "volumeLevel"
        anchors.right: parent.right
        anchors.verticalCenter: parent.verticalCenter
        width: 72
        horizontalAlignment: Text.AlignRight
        text: root.level
        strong: true
    }
}
