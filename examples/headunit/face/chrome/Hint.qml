import QtQuick 2.15
import HeadUnit 1.0
import ".."
import "../controls"

/** Tells the driver for a moment why the car does not do what was asked for. */
Rectangle {
    id: root

    readonly property var sentences: ({
        "no video while driving": "Videos are not shown while driving.",
        "no typing while driving": "No typing while driving. Say where you want to go.",
        "updates need gear P": "Updates need the car to be parked, in gear P.",
        "no phone connected": "No phone is connected. You can connect one here.",
        "not while driving: system/update": "The update waits until you have parked.",
        "not while driving: navigation/advert": "Offers are not shown while driving."
    })

    function show(hint) {
        label.text = root.sentences[hint] || hint.charAt(0).toUpperCase() + hint.slice(1) + ".";
        time.restart();
    }

    width: row.width + 56
    height: 72
    radius: 36
    color: Theme.pressed
    border.width: 1
    border.color: Theme.disabled
    visible: time.running

    Timer {
        id: time

        interval: 3000
    }

    Connections {
        target: Inspector

        function onHintShown(text) {
            root.show(text);
        }
    }

    // Whoever asks for something else has read it.
    Connections {
        target: Inspector.requests

        function onRowsInserted() {
            time.stop();
        }
    }

    Row {
        id: row

        anchors.centerIn: parent
        spacing: 16

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            name: "info"
            size: 32
            color: Theme.warning
        }

        Label {
            id: label

            objectName: "hint-text"
            anchors.verticalCenter: parent.verticalCenter
        }
    }
}
