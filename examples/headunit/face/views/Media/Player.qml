import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import "../.."
import "../../controls"

/** What is playing. The flow says which track it is; the picture moves on by itself. */
Page {
    id: root

    readonly property var track: MediaLibrary.currentTrack
    readonly property color tint: root.track.second
    readonly property var sourceNames: ({ usb: "USB stick", radio: "Radio", bluetooth: "Phone" })

    // Tells the flow of the new track, as the player of a car would.
    function step(direction) {
        MediaLibrary.select(MediaLibrary.currentIndex + direction)
        Requests.event("TrackChanged", { title: root.track.title, artist: root.track.artist, seconds: root.track.seconds })
    }

    onActivationDataChanged: MediaLibrary.tell(root.activationData)

    Rectangle {
        anchors.fill: parent
        gradient: Gradient {
            GradientStop { position: 0; color: Qt.tint(Theme.background, Qt.rgba(root.tint.r, root.tint.g, root.tint.b, 0.7)) }
            GradientStop { position: 1; color: Theme.background }
        }
    }
    ScreenHeader {
        id: header
        anchors { left: parent.left; right: parent.right; top: parent.top }
        title: "Now playing"

        TouchButton { objectName: "button-sources"; height: 72; icon: "radio"; text: "Sources"; onClicked: Requests.view("Media/Sources") }
        TouchButton { objectName: "button-queue"; height: 72; icon: "queue_music"; text: "Queue"; onClicked: Requests.view("Media/Queue") }
        TouchButton {
            objectName: "button-video"
            height: 72
            icon: "movie"
            text: "Video"
            contentColor: Vehicle.moving ? Theme.disabled : Theme.text
            onClicked: Requests.event("ShowVideo")
        }
    }
    CoverArt {
        id: cover
        anchors { left: parent.left; leftMargin: 48; top: header.bottom; topMargin: 20 }
        width: 416
        height: 416
        radius: 28
        first: root.track.first
        second: root.track.second
        pattern: root.track.pattern
    }
    Column {
        anchors { left: cover.right; leftMargin: 56; right: parent.right; rightMargin: 48; top: cover.top; topMargin: 8 }

        Label {
            kind: Label.Small
            color: Theme.accent
            text: root.sourceNames[MediaLibrary.source] + "  ·  " + root.track.album
        }
        Item { width: 1; height: 10 }
        Label {
            objectName: "track-title"
            width: parent.width
            kind: Label.Title
            font.pixelSize: 56
            text: root.track.title
        }
        Label {
            objectName: "track-artist"
            width: parent.width
            text: root.track.artist
            font.pixelSize: 32
            opacity: 0.8
        }
    }
    Transport {
        anchors { left: cover.right; leftMargin: 56; right: parent.right; rightMargin: 48; bottom: cover.bottom }
        onPrevious: root.step(-1)
        onNext: root.step(1)
    }
}
