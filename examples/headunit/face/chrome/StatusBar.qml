import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import ".."
import "../controls"

/** The bar above the screen: where the driver is, and what is going on in the car. */
Item {
    id: root

    property bool titleShown: true

    /** The state of the audio's region, "Playing" and the like. */
    readonly property string audio: {
        const states = Inspector.activeStates || [];
        const found = states.find(state => state.startsWith("Audio/"));
        return found ? found.slice("Audio/".length) : "Playing";
    }

    Behavior on opacity {
        NumberAnimation { duration: 200 }
    }

    Row {
        anchors.left: parent.left
        anchors.leftMargin: Theme.margin
        anchors.verticalCenter: parent.verticalCenter
        spacing: 12
        visible: root.titleShown

        DomainIcon {
            anchors.verticalCenter: parent.verticalCenter
            domain: ViewTarget.activeDomainName
            size: 26
            color: Theme.accent
        }

        Label {
            objectName: "status-domain"
            anchors.verticalCenter: parent.verticalCenter
            text: ViewTarget.activeDomainName
            kind: Label.Small
        }
    }

    DrivingBadge {
        id: driving

        objectName: "status-driving"
        anchors.centerIn: parent
        shown: Vehicle.moving
        speed: Vehicle.speed
    }

    Row {
        anchors.right: parent.right
        anchors.rightMargin: Theme.margin
        anchors.verticalCenter: parent.verticalCenter
        spacing: 24

        AudioBadge {
            objectName: "status-audio"
            anchors.verticalCenter: parent.verticalCenter
            audio: root.audio
        }

        Icon {
            objectName: "status-phone"
            anchors.verticalCenter: parent.verticalCenter
            name: Vehicle.phoneConnected ? "smartphone" : "mobile_off"
            size: 28
            color: Vehicle.phoneConnected ? Theme.text : Theme.disabled
        }

        Label {
            objectName: "status-time"
            anchors.verticalCenter: parent.verticalCenter
            text: Qt.formatTime(clock.now, Preferences.clockFormat)
            kind: Label.Normal
        }
    }

    Timer {
        id: clock

        property date now: new Date()

        interval: 1000
        repeat: true
        running: true
        onTriggered: clock.now = new Date()
    }
}
