import QtQuick 2.15
import "../.."
import "../../controls"

/** What is playing, on the picture of its album. */
Card {
    id: root

    readonly property var track: MediaLibrary.currentTrack

    padding: 0
    touchable: true

    CoverArt {
        anchors.fill: parent
        anchors.margins: 1
        first: root.track.first
        second: root.track.second
        pattern: root.track.pattern
    }
    Rectangle {
        anchors.fill: parent
        anchors.margins: 1
        radius: Theme.radius
        opacity: root.pressed ? 0.95 : 1
        gradient: Gradient {
            GradientStop { position: 0; color: "#000b0f14" }
            GradientStop { position: 0.3; color: "#380b0f14" }
            GradientStop { position: 0.58; color: "#d80b0f14" }
            GradientStop { position: 1; color: "#fa0b0f14" }
        }
    }
    Column {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: 20 }
        spacing: 12

        Column {
            width: parent.width

            Label {
                width: parent.width
                strong: true
                text: root.track.title
            }
            Label {
                width: parent.width
                kind: Label.Small
                text: root.track.artist
                opacity: 0.75
            }
        }
        ProgressBar {
            width: parent.width
            implicitHeight: 6
            value: MediaLibrary.position / root.track.seconds
            color: "#40ffffff"
            barColor: Theme.text
        }
        Row {
            anchors.horizontalCenter: parent.horizontalCenter
            spacing: 28

            TouchButton {
                objectName: "button-previous"
                width: 72; height: 72
                round: true
                kind: TouchButton.Flat
                icon: "skip_previous"
                iconSize: 44
                onClicked: MediaLibrary.select(MediaLibrary.currentIndex - 1)
            }
            TouchButton {
                objectName: "button-play"
                width: 76; height: 76
                round: true
                kind: TouchButton.Primary
                icon: MediaLibrary.playing ? "pause" : "play_arrow"
                iconSize: 44
                onClicked: MediaLibrary.playing = !MediaLibrary.playing
            }
            TouchButton {
                objectName: "button-next"
                width: 72; height: 72
                round: true
                kind: TouchButton.Flat
                icon: "skip_next"
                iconSize: 44
                onClicked: MediaLibrary.select(MediaLibrary.currentIndex + 1)
            }
        }
    }
}
