import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"

/** A film for when the car stands: the controls lie on the picture, and a touch takes them away. */
Page {
    id: root

    readonly property int length: 42 * 60
    property bool playing: true
    property bool controlsShown: true
    property int position: 754

    color: "#000000"

    Timer {
        interval: 1000
        repeat: true
        running: root.playing
        onTriggered: root.position = (root.position + 1) % root.length
    }
    Landscape {
        anchors.fill: parent
        running: root.playing
    }
    MouseArea {
        objectName: "picture"
        anchors.fill: parent
        onClicked: root.controlsShown = !root.controlsShown
    }
    Item {
        anchors.fill: parent
        visible: root.controlsShown

        Rectangle {
            anchors { left: parent.left; right: parent.right; top: parent.top }
            height: 132
            gradient: Gradient {
                GradientStop { position: 0; color: "#d00b0f14" }
                GradientStop { position: 1; color: "#000b0f14" }
            }
        }
        ScreenHeader {
            anchors { left: parent.left; right: parent.right; top: parent.top }
            title: "By the Long Lake"
            subtitle: "Slow Journeys, part 3"
        }
        Rectangle {
            anchors { left: parent.left; right: parent.right; bottom: parent.bottom }
            height: 180
            gradient: Gradient {
                GradientStop { position: 0; color: "#000b0f14" }
                GradientStop { position: 1; color: "#e80b0f14" }
            }
        }
        Row {
            id: bar
            anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.margin; bottomMargin: 20 }
            height: 84
            spacing: 24

            TouchButton {
                id: button
                objectName: "button-play"
                width: 84
                height: 84
                round: true
                kind: TouchButton.Primary
                icon: root.playing ? "pause" : "play_arrow"
                iconSize: 48
                onClicked: root.playing = !root.playing
            }
            Label {
                id: passed
                anchors.verticalCenter: parent.verticalCenter
                width: 72
                kind: Label.Small
                text: MediaLibrary.time(root.position)
            }
            SliderBar {
                anchors.verticalCenter: parent.verticalCenter
                objectName: "slider-position"
                width: bar.width - button.width - 2 * passed.width - 3 * bar.spacing
                value: root.position / root.length
                onMoved: root.position = value * root.length
            }
            Label {
                anchors.verticalCenter: parent.verticalCenter
                width: 72
                kind: Label.Small
                horizontalAlignment: Text.AlignRight
                text: MediaLibrary.time(root.length)
            }
        }
    }
}
