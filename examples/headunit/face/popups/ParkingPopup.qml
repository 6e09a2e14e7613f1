import QtQuick 2.15
import ".."
import "../controls"

/** The parking aid, beside the rear camera's picture. */
PopupFrame {
    id: root

    readonly property int centimetres: Number(root.read("centimetres", 100))
    readonly property color ink: root.centimetres < 30 ? Theme.critical
        : root.centimetres < 80 ? Theme.warning : Theme.positive

    stripe: root.ink
    panelWidth: 320
    panelHeight: 456
    panelX: root.width - panelWidth - Theme.margin
    panelY: 148

    Label {
        id: title

        objectName: "popup-title"
        x: Theme.margin
        y: 12
        height: 72
        text: "Parking aid"
        strong: true
    }

    TouchButton {
        objectName: "dismiss"
        anchors.right: parent.right
        anchors.rightMargin: 12
        anchors.verticalCenter: title.verticalCenter
        width: 72
        height: 72
        kind: TouchButton.Flat
        icon: "close"
        round: true
        onClicked: root.dismiss()
    }

    ParkingPicture {
        anchors.horizontalCenter: parent.horizontalCenter
        anchors.top: title.bottom
        anchors.topMargin: 8
        centimetres: root.centimetres
        ink: root.ink
    }

    Row {
        anchors.horizontalCenter: parent.horizontalCenter
        anchors.bottom: parent.bottom
        anchors.bottomMargin: 24
        spacing: 10

        Label {
            id: number

            text: root.centimetres
            kind: Label.Title
            font.pixelSize: 56
            color: root.ink
        }

        Label {
            anchors.baseline: number.baseline
            text: "cm"
            muted: true
        }
    }
}
