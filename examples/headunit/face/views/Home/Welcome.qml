import QtQuick 2.15
import HeadUnit 1.0
import "../.."
import "../../controls"

/** What the driver is met with while the systems come up. */
Page {
    id: root

    Clock { id: clock }

    // There are no soft keys yet: it goes on to the edge of the display.
    Backdrop {
        anchors { fill: parent; bottomMargin: -80 }
        horizon: 0.8
        strength: 1.4
    }
    Column {
        anchors { horizontalCenter: parent.horizontalCenter; top: parent.top; topMargin: 108 }
        spacing: 12

        Emblem {
            anchors.horizontalCenter: parent.horizontalCenter
            width: 132
            height: 132
        }
        Item { width: 1; height: 12 }
        Label {
            objectName: "title"
            anchors.horizontalCenter: parent.horizontalCenter
            kind: Label.Huge
            text: "Welcome, " + Preferences.driver
            font.pixelSize: 76
        }
        Label {
            anchors.horizontalCenter: parent.horizontalCenter
            text: clock.date
            opacity: 0.8
        }
    }
    Row {
        anchors { horizontalCenter: parent.horizontalCenter; bottom: parent.bottom; bottomMargin: 56 }
        spacing: 18

        Row {
            anchors.verticalCenter: parent.verticalCenter
            spacing: 12

            Repeater {
                model: 3

                Rectangle {
                    id: dot
                    width: 12
                    height: 12
                    radius: 6
                    color: Theme.accent
                    opacity: Vehicle.ready ? 1 : 0.25

                    SequentialAnimation on opacity {
                        running: !Vehicle.ready
                        loops: Animation.Infinite

                        PauseAnimation { duration: model.index * 180 }
                        NumberAnimation { from: 0.25; to: 1; duration: 300 }
                        NumberAnimation { from: 1; to: 0.25; duration: 300 }
                        PauseAnimation { duration: 720 - model.index * 180 }
                    }
                }
            }
        }
        Label {
            anchors.verticalCenter: parent.verticalCenter
            kind: Label.Small
            muted: true
            text: Vehicle.ready ? "Ready" : "Preparing your car"
        }
    }
}
