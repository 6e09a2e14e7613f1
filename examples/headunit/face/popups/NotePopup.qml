import QtQuick 2.15
import ".."
import "../controls"

/** A note: a banner at the top, which leaves the screen usable. */
PopupFrame {
    id: root

    readonly property var notes: ({
        "phone/ended": {
            icon: "call_end", ink: Theme.secondary, title: "Call ended", text: root.callTime()
        },
        "phone/lost": {
            icon: "mobile_off", ink: Theme.warning, title: "Phone disconnected",
            text: "Calls and contacts are not available"
        },
        "media/lost": {
            icon: root.sourceIcon(), ink: Theme.warning, title: root.sourceName() + " disconnected",
            text: "Playback has stopped"
        },
        "navigation/advert": {
            icon: "local_offer", ink: Theme.accent, title: root.read("shop", "Mill Lane Bakery"),
            text: root.read("text", "Fresh coffee, 400 m from your route")
        }
    })
    readonly property var note: root.notes[root.popupId]
        || { icon: "info", ink: Theme.accent, title: root.read("title", "Note"), text: root.read("text", "") }

    function callTime() {
        const seconds = Number(root.read("seconds", 0));
        return seconds > 0 ? "Duration " + Math.floor(seconds / 60) + ":" + String(seconds % 60).padStart(2, "0")
                           : "The line is free";
    }

    function sourceName() {
        const names = { usb: "USB stick", radio: "Radio", bluetooth: "Bluetooth" };
        return names[root.read("source", "usb")] || "Source";
    }

    function sourceIcon() {
        const icons = { usb: "usb", radio: "radio", bluetooth: "bluetooth_disabled" };
        return icons[root.read("source", "usb")] || "music_off";
    }

    panelWidth: 760
    panelHeight: 112
    panelY: 8
    surface: Theme.raised
    radius: 28

    PopupSign {
        id: sign

        x: 20
        anchors.verticalCenter: parent.verticalCenter
        icon: root.note.icon
        ink: root.note.ink
    }

    Column {
        anchors.left: sign.right
        anchors.leftMargin: 20
        anchors.right: close.left
        anchors.rightMargin: 12
        anchors.verticalCenter: parent.verticalCenter
        spacing: 4

        Label {
            objectName: "popup-title"
            width: parent.width
            text: root.note.title
            strong: true
        }

        Label {
            width: parent.width
            visible: text !== ""
            text: root.note.text
            kind: Label.Small
            muted: true
        }
    }

    TouchButton {
        id: close

        objectName: "dismiss"
        anchors.right: parent.right
        anchors.rightMargin: 14
        anchors.verticalCenter: parent.verticalCenter
        kind: TouchButton.Flat
        icon: "close"
        round: true
        onClicked: root.dismiss()
    }
}
