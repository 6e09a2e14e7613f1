import QtQuick 2.15
import "../.."
import "../../controls"

/** Where in the track the player is, and the buttons that move it. */
Item {
    id: root

    signal previous()
    signal next()

    implicitHeight: 236

    SliderBar {
        id: bar
        objectName: "slider-position"
        anchors { left: parent.left; right: parent.right; top: parent.top }
        value: MediaLibrary.position / MediaLibrary.currentTrack.seconds
        onMoved: MediaLibrary.position = value * MediaLibrary.currentTrack.seconds
    }
    Label {
        anchors { left: parent.left; top: bar.bottom; topMargin: -8 }
        kind: Label.Small
        text: MediaLibrary.time(MediaLibrary.position)
        opacity: 0.75
    }
    Label {
        anchors { right: parent.right; top: bar.bottom; topMargin: -8 }
        kind: Label.Small
        text: MediaLibrary.time(MediaLibrary.currentTrack.seconds)
        opacity: 0.75
    }
    Item {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom }
        height: 112

        TouchButton {
            objectName: "button-shuffle"
            anchors { left: parent.left; verticalCenter: parent.verticalCenter }
            width: 76; height: 76
            round: true
            kind: TouchButton.Flat
            icon: "shuffle"
            checked: MediaLibrary.shuffle
            onClicked: MediaLibrary.shuffle = !MediaLibrary.shuffle
        }
        Row {
            anchors.centerIn: parent
            spacing: 32

            TouchButton {
                objectName: "button-previous"
                anchors.verticalCenter: parent.verticalCenter
                width: 88; height: 88
                round: true
                kind: TouchButton.Flat
                icon: "skip_previous"
                iconSize: 56
                onClicked: root.previous()
            }
            TouchButton {
                objectName: "button-play"
                width: 112; height: 112
                round: true
                kind: TouchButton.Primary
                icon: MediaLibrary.playing ? "pause" : "play_arrow"
                iconSize: 64
                onClicked: MediaLibrary.playing = !MediaLibrary.playing
            }
            TouchButton {
                objectName: "button-next"
                anchors.verticalCenter: parent.verticalCenter
                width: 88; height: 88
                round: true
                kind: TouchButton.Flat
                icon: "skip_next"
                iconSize: 56
                onClicked: root.next()
            }
        }
        TouchButton {
            objectName: "button-repeat"
            anchors { right: parent.right; verticalCenter: parent.verticalCenter }
            width: 76; height: 76
            round: true
            kind: TouchButton.Flat
            icon: "repeat"
            checked: MediaLibrary.repeat
            onClicked: MediaLibrary.repeat = !MediaLibrary.repeat
        }
    }
}
