import QtQuick 2.15
import HeadUnit 1.0
import "../.."
import "../../controls"

/** The picture of the rear camera, for as long as the car is in reverse. */
Page {
    id: root

    color: "#000000"

    RearScene { anchors.fill: parent }
    ParkedCar { anchors.fill: parent; middle: -2.6 }
    ParkedCar { anchors.fill: parent; middle: 2.65; near: 1.5; paint: "#8a4a44" }
    GuideLines { anchors.fill: parent }

    Rectangle {
        anchors { left: parent.left; right: parent.right; top: parent.top }
        height: 96
        gradient: Gradient {
            GradientStop { position: 0; color: "#c0000000" }
            GradientStop { position: 1; color: "#00000000" }
        }
    }
    Row {
        x: Theme.margin
        y: 20
        spacing: 18

        Rectangle {
            width: 56
            height: 56
            radius: 14
            color: Theme.text

            Label {
                anchors.centerIn: parent
                text: Vehicle.gear
                font.pixelSize: 34
                font.weight: Font.Bold
                color: Theme.background
            }
        }
        Label {
            objectName: "title"
            anchors.verticalCenter: parent.verticalCenter
            text: "Rear camera"
            font.weight: Font.Medium
        }
    }
    Rectangle {
        anchors { right: parent.right; rightMargin: Theme.margin; top: parent.top; topMargin: 18 }
        width: hint.width + 56
        height: 60
        radius: 30
        color: "#c00b0f14"

        Row {
            id: hint
            anchors.centerIn: parent
            spacing: 14

            Icon { anchors.verticalCenter: parent.verticalCenter; name: "warning"; color: Theme.warning }
            Label {
                anchors.verticalCenter: parent.verticalCenter
                kind: Label.Small
                text: "Check the surroundings yourself"
            }
        }
    }
}
