import QtQuick 2.15
import ".."

/** A popup in the side panel: its name, and below it what kind it is and where it lies. */
Item {
    id: root

    property string name
    property string layerName
    property int kind: 0
    property int remainingTime: 0
    property bool covered: false
    property bool waiting: false

    readonly property var kinds: ["", "", "note", "question", "warning", "overlay"]

    height: 50

    PanelText {
        id: title

        height: 23
        text: root.name
        color: root.waiting ? Theme.secondary : root.covered ? Theme.warning : Theme.positive
    }

    PanelText {
        anchors.right: parent.right
        height: 23
        text: root.waiting ? "waiting" : root.covered ? "covered" : "shown"
        color: title.color
    }

    PanelText {
        y: 22
        height: 23
        text: (root.kinds[root.kind] || "kind " + root.kind) + " in " + root.layerName
        color: Theme.secondary
    }

    PanelText {
        anchors.right: parent.right
        y: 22
        height: 23
        visible: root.remainingTime > 0
        text: (root.remainingTime / 1000).toFixed(1) + " s left"
        color: Theme.secondary
    }
}
