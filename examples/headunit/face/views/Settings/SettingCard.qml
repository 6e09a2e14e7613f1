import QtQuick 2.15
import "../.."
import "../../controls"

/** Something to be set, with its name and its value at the top. */
Card {
    id: root

    property string title
    property string value
    property string hint

    padding: 24

    Label {
        text: root.title
        font.weight: Font.Medium
    }
    Label {
        anchors.right: parent.right
        muted: true
        text: root.value
    }
    Label {
        y: 40
        kind: Label.Small
        muted: true
        text: root.hint
    }
}
