import QtQuick 2.15
import ".."

/** A request in the side panel, with a mark that tells whether it was granted. */
Item {
    id: root

    property string time
    property string request
    property string outcome
    property bool accepted: false

    readonly property color ink: root.accepted ? Theme.positive : Theme.critical

    height: 52

    Rectangle {
        x: -20
        y: 3
        width: 4
        height: 40
        radius: 2
        color: root.ink
    }

    PanelText {
        width: parent.width - clock.width - 12
        height: 23
        text: root.request
    }

    PanelText {
        id: clock

        anchors.right: parent.right
        height: 23
        text: root.time
        color: Theme.secondary
    }

    PanelText {
        y: 22
        width: parent.width
        height: 23
        text: root.outcome
        color: root.ink
    }
}
