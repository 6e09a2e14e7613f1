import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import "../.."
import "../../controls"

/** Where music can come from. The screen stays while a source connects. */
Page {
    id: root

    readonly property bool connecting: Inspector.activeStates.indexOf("Media/Connecting") >= 0
    readonly property var sources: [
        { name: "usb", title: "USB stick", subtitle: "Travel mix, 214 tracks", icon: "usb", color: "#3da9fc" },
        { name: "radio", title: "Radio", subtitle: "Coast FM 97.4", icon: "radio", color: "#f5b14c" },
        { name: "bluetooth", title: "Phone", subtitle: Vehicle.phoneConnected ? "Mara's phone" : "Not connected",
          icon: "bluetooth_audio", color: "#4ccf9a" }
    ]

    function play(album) {
        MediaLibrary.select(MediaLibrary.tracks.findIndex(function(track) { return track.album === album }))
        Requests.view("Media/Player")
    }

    title: "Sources"
    actions: [
        TouchButton { objectName: "button-player"; height: 72; icon: "album"; text: "Player"; onClicked: Requests.view("Media/Player") }
    ]

    Row {
        id: cards
        anchors { left: parent.left; right: parent.right; top: parent.top }
        spacing: Theme.gap

        Repeater {
            model: root.sources

            SourceCard {
                objectName: "button-" + modelData.name
                width: (cards.width - 2 * Theme.gap) / 3
                height: 212
                icon: modelData.icon
                title: modelData.title
                subtitle: modelData.subtitle
                tint: modelData.color
                enabled: modelData.name !== "bluetooth" || Vehicle.phoneConnected
                active: MediaLibrary.source === modelData.name
                connecting: root.connecting && MediaLibrary.source === modelData.name
                onClicked: {
                    MediaLibrary.source = modelData.name
                    Requests.event("SelectSource", modelData.name)
                }
            }
        }
    }
    Label {
        id: heading
        anchors { top: cards.bottom; topMargin: 20 }
        kind: Label.Small
        muted: true
        text: "Played last"
    }
    Row {
        anchors { left: parent.left; right: parent.right; top: heading.bottom; topMargin: 12; bottom: parent.bottom }
        spacing: (width - 6 * 160) / 5

        Repeater {
            model: MediaLibrary.albums

            AlbumCover {
                objectName: "album-" + model.index
                width: 160
                height: parent.height
                album: modelData
                onClicked: root.play(model.index)
            }
        }
    }
}
