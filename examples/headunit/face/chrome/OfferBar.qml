import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import ".."
import "../controls"

/** What guidance offers on the way; only the OK on the wheel takes it, so that no hand leaves it. */
Rectangle {
    id: root

    readonly property bool offered: (Inspector.activeStates || []).indexOf("Guidance/Offer") >= 0
    /** Decided when the offer comes: fuel that changes later does not make another offer of it. */
    property bool fuel: false

    onOfferedChanged: {
        if (root.offered) {
            root.fuel = Vehicle.fuel < 10;
        }
    }

    width: 760
    height: 96
    radius: 28
    color: Theme.raised
    border.width: 1
    border.color: Theme.disabled
    visible: root.offered && ViewTarget.popupsEnabled

    MouseArea {
        anchors.fill: parent
    }

    Icon {
        id: sign

        x: 28
        anchors.verticalCenter: parent.verticalCenter
        name: root.fuel ? "local_gas_station" : "alt_route"
        size: 44
        color: Theme.accent
    }

    Column {
        anchors.left: sign.right
        anchors.leftMargin: 24
        anchors.right: close.left
        anchors.rightMargin: Theme.gap
        anchors.verticalCenter: parent.verticalCenter
        spacing: 2

        Label {
            objectName: "offer-title"
            width: parent.width
            text: root.fuel ? "Stop for fuel at Harbour Street?" : "Take the way around the jam?"
            strong: true
        }

        Label {
            width: parent.width
            text: "Press OK on the wheel to accept"
            kind: Label.Small
            muted: true
        }
    }

    TouchButton {
        id: close

        objectName: "offer-dismiss"
        anchors.right: parent.right
        anchors.rightMargin: 12
        anchors.verticalCenter: parent.verticalCenter
        kind: TouchButton.Flat
        icon: "close"
        round: true
        onClicked: Requests.event("Dismiss")
    }
}
