import QtQuick 2.15
import HeadUnit 1.0
import ".."
import "../controls"

/** Too fast: stays beside what is on the screen, which has to remain usable at that speed. */
PopupFrame {
    id: root

    readonly property int limit: Number(root.read("limit", 130))

    stripe: Theme.warning
    surface: Theme.raised
    panelWidth: 520
    panelHeight: 152
    panelX: root.width - panelWidth - Theme.margin
    panelY: 136

    SpeedSign {
        id: sign

        x: 34
        anchors.verticalCenter: parent.verticalCenter
        limit: root.limit
    }

    Column {
        anchors.left: sign.right
        anchors.leftMargin: 24
        anchors.verticalCenter: parent.verticalCenter
        spacing: 4

        Label {
            objectName: "popup-title"
            text: "Too fast"
            strong: true
            color: Theme.warning
        }

        Label {
            text: Vehicle.speed > root.limit ? Vehicle.speed + " km/h" : "Slow down"
            kind: Label.Title
        }
    }

    TouchButton {
        objectName: "dismiss"
        anchors.right: parent.right
        anchors.rightMargin: 12
        anchors.verticalCenter: parent.verticalCenter
        kind: TouchButton.Flat
        icon: "close"
        round: true
        onClicked: root.dismiss()
    }
}
