import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"

/** What is going to be played, in its order. */
Page {
    id: root

    readonly property int minutes: MediaLibrary.tracks.reduce(function(sum, track) { return sum + track.seconds }, 0) / 60

    title: "Queue"
    subtitle: MediaLibrary.tracks.length + " tracks, " + root.minutes + " minutes"
    actions: [
        TouchButton {
            objectName: "button-shuffle"
            height: 72
            icon: "shuffle"
            text: "Shuffle"
            checked: MediaLibrary.shuffle
            onClicked: MediaLibrary.shuffle = !MediaLibrary.shuffle
        }
    ]

    Card {
        id: current
        anchors { left: parent.left; top: parent.top; bottom: parent.bottom }
        width: 336

        CoverArt {
            id: cover
            width: parent.width
            height: width
            first: MediaLibrary.currentTrack.first
            second: MediaLibrary.currentTrack.second
            pattern: MediaLibrary.currentTrack.pattern
        }
        Column {
            anchors { left: parent.left; right: parent.right; top: cover.bottom; topMargin: 20 }

            Label { width: parent.width; strong: true; text: MediaLibrary.currentTrack.title }
            Label { width: parent.width; kind: Label.Small; muted: true; text: MediaLibrary.currentTrack.artist }
        }
        ProgressBar {
            anchors { left: parent.left; right: parent.right; bottom: parent.bottom }
            value: MediaLibrary.position / MediaLibrary.currentTrack.seconds
        }
    }
    TouchList {
        objectName: "list"
        anchors { left: current.right; leftMargin: 24; right: parent.right; top: parent.top; bottom: parent.bottom }
        model: MediaLibrary.tracks.length
        currentIndex: MediaLibrary.currentIndex

        delegate: TrackRow {
            objectName: "row-" + model.index
            width: ListView.view.width - 16
            track: MediaLibrary.track(model.index)
            current: model.index === MediaLibrary.currentIndex && !MediaLibrary.foreign
            onClicked: MediaLibrary.select(model.index)
        }
    }
}
