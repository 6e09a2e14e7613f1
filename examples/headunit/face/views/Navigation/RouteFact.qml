import QtQuick 2.15
import "../.."
import "../../controls"

/** One thing to know about a route. */
Item {
    id: root

    property string icon
    property string name
    property string value

    height: 56

    Icon {
        anchors.verticalCenter: parent.verticalCenter
        name: root.icon
        size: 30
        color: Theme.accent
    }
    Label {
        anchors { left: parent.left; leftMargin: 48; verticalCenter: parent.verticalCenter }
        kind: Label.Small
        muted: true
        text: root.name
    }
    Label {
        anchors { right: parent.right; verticalCenter: parent.verticalCenter }
        text: root.value
        font.weight: Font.Medium
    }
}
