import QtQuick 2.15
import "../.."
import "../../controls"

/** A track in a list, with its cover. */
ListRow {
    id: root

    property var track
    property bool current: false

    title: root.track.title
    subtitle: root.track.artist
    trailing: MediaLibrary.time(root.track.seconds)
    selected: root.current
    leading: Component {
        CoverArt {
            width: 64
            height: 64
            radius: 10
            first: root.track.first
            second: root.track.second
            pattern: root.track.pattern
        }
    }

    Icon {
        anchors.verticalCenter: parent.verticalCenter
        visible: root.current
        name: MediaLibrary.playing ? "graphic_eq" : "pause"
        color: Theme.accent
    }
}
