import QtQuick 2.15
import "../.."
import "../../controls"

/** A place that is offered while its name is typed. */
Card {
    id: root

    property string icon
    property string title
    property string subtitle

    height: 108
    padding: 0
    touchable: true

    Rectangle {
        id: sign
        anchors { left: parent.left; leftMargin: 20; verticalCenter: parent.verticalCenter }
        width: 60
        height: 60
        radius: 30
        color: Theme.accentSoft

        Icon {
            anchors.centerIn: parent
            name: root.icon
            size: 32
            color: Theme.accent
        }
    }
    Column {
        anchors { left: sign.right; leftMargin: 18; right: parent.right; rightMargin: 14; verticalCenter: parent.verticalCenter }

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
}
