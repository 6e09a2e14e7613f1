import QtQuick 2.15
import "../.."
import "../../controls"

/** A place that was found, with the sign that it has on the map. */
Card {
    id: root

    property string sign
    property string title
    property string subtitle
    property string distance

    height: 136
    padding: 0
    touchable: true

    Rectangle {
        id: badge
        anchors { left: parent.left; leftMargin: 24; verticalCenter: parent.verticalCenter }
        width: 64
        height: 64
        radius: 32
        color: Theme.accent

        Label {
            anchors.centerIn: parent
            text: root.sign
            color: Theme.accentText
            font.weight: Font.Bold
        }
    }
    Column {
        anchors { left: badge.right; leftMargin: 24; right: far.left; rightMargin: 12; verticalCenter: parent.verticalCenter }
        spacing: 4

        Label {
            width: parent.width
            text: root.title
            font.weight: Font.Medium
        }
        Label {
            width: parent.width
            kind: Label.Small
            muted: true
            text: root.subtitle
        }
    }
    Label {
        id: far
        anchors { right: chevron.left; rightMargin: 4; verticalCenter: parent.verticalCenter }
        kind: Label.Small
        text: root.distance
    }
    Icon {
        id: chevron
        anchors { right: parent.right; rightMargin: 16; verticalCenter: parent.verticalCenter }
        name: "chevron_right"
        color: Theme.secondary
    }
}
