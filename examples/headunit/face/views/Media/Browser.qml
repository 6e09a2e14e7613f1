import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"

/** The music of the source: albums at the left, and the tracks of the one that was touched. */
Page {
    id: root

    readonly property string folder: root.read(root.read(root.viewData, "eventData", undefined), "folder", "")
    property int album: root.albumOf(root.folder) ///< -1: all of them
    readonly property var found: root.tracksOf(root.album)

    function albumOf(folder) {
        if (folder === "")
            return -1
        return MediaLibrary.albums.findIndex(function(album) { return album.title.indexOf(folder) >= 0 })
    }

    function tracksOf(album) {
        var indexes = MediaLibrary.tracks.map(function(track, index) { return index })
        return album < 0 ? indexes : indexes.filter(function(index) { return MediaLibrary.tracks[index].album === album })
    }

    title: root.folder !== "" ? root.folder : "Music"
    subtitle: root.album >= 0 ? MediaLibrary.albums[root.album].artist + ", " + MediaLibrary.albums[root.album].year
                              : "All tracks of the stick"
    actions: [
        TouchButton {
            objectName: "button-all"
            height: 72
            icon: "library_music"
            text: "All tracks"
            checked: root.album < 0
            onClicked: root.album = -1
        }
    ]

    Grid {
        id: covers
        anchors { left: parent.left; top: parent.top; topMargin: 4; bottom: parent.bottom }
        columns: 3
        columnSpacing: 20
        rowSpacing: 16

        Repeater {
            model: MediaLibrary.albums

            AlbumCover {
                objectName: "album-" + model.index
                width: 176
                height: 216
                album: modelData
                selected: model.index === root.album
                onClicked: root.album = model.index
            }
        }
    }
    TouchList {
        objectName: "list"
        anchors { left: covers.right; leftMargin: 32; right: parent.right; top: parent.top; bottom: parent.bottom }
        model: root.found

        delegate: TrackRow {
            objectName: "row-" + model.index
            width: ListView.view.width - 16
            track: MediaLibrary.track(modelData)
            current: modelData === MediaLibrary.currentIndex && !MediaLibrary.foreign
            onClicked: {
                MediaLibrary.select(modelData)
                Requests.event("Confirm", "touch")
            }
        }
    }
}
