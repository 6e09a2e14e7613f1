import QtQuick 2.15
import "../.."
import "../../controls"

/** A small tile: an icon and one word. */
Card {
    id: root

    property string icon
    property string title
    property color iconColor: Theme.accent

    implicitWidth: 168
    implicitHeight: 96
    padding: 14
    touchable: true

    Icon {
        id: symbol
        anchors.verticalCenter: parent.verticalCenter
        name: root.icon
        size: 34
        color: root.iconColor
    }
    Label {
        anchors { left: symbol.right; leftMargin: 10; right: parent.right; verticalCenter: parent.verticalCenter }
        kind: Label.Small
        text: root.title
        font.weight: Font.Medium
    }
}
