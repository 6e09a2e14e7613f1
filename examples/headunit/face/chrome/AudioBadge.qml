import QtQuick 2.15
import ".."
import "../controls"

/** What is heard, as the audio's region has it. */
Row {
    id: root

    property string audio: "Playing"

    readonly property var looks: ({
        Playing: { icon: "volume_up", text: "", ink: Theme.text },
        Muted: { icon: "volume_off", text: "Muted", ink: Theme.warning },
        Announcement: { icon: "campaign", text: "Traffic news", ink: Theme.accent },
        Ringing: { icon: "ring_volume", text: "Ringing", ink: Theme.positive },
        Call: { icon: "phone_in_talk", text: "In call", ink: Theme.positive }
    })
    readonly property var look: root.looks[root.audio] || root.looks.Playing

    spacing: 8

    Icon {
        anchors.verticalCenter: parent.verticalCenter
        name: root.look.icon
        size: 28
        color: root.look.ink
    }

    Label {
        anchors.verticalCenter: parent.verticalCenter
        visible: text !== ""
        text: root.look.text
        kind: Label.Small
        color: root.look.ink
    }
}
