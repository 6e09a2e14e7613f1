import QtQuick 2.15
import ".."

/** What the driver has to do next on the route, and at the turn after it. */
Card {
    id: root

    required property MapRoute route

    readonly property int metres: Math.round(root.route.distanceToTurn / 10) * 10
    readonly property string street: root.route.turn.street

    width: 420
    height: root.route.afterwards ? 208 : 140
    padding: 0

    Icon {
        x: 22
        y: 28
        name: root.route.turn.icon
        size: 84
        color: Theme.text
    }
    Column {
        anchors { left: parent.left; leftMargin: 126; right: parent.right; rightMargin: 20 }
        y: 20

        Label {
            objectName: "guidance-distance"
            text: root.metres < 1000 ? root.metres + " m" : (root.metres / 1000).toFixed(1) + " km"
            font { pixelSize: 48; weight: Font.DemiBold; letterSpacing: -1 }
        }
        Label {
            objectName: "guidance-street"
            width: parent.width
            text: root.street
            color: Theme.secondary
        }
    }
    Rectangle {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: 1 }
        visible: root.route.afterwards !== undefined
        height: 62
        radius: Theme.radius
        color: Theme.raised

        Rectangle {
            anchors { left: parent.left; right: parent.right; top: parent.top }
            height: 24
            color: parent.color
        }
        Row {
            anchors { left: parent.left; leftMargin: 24; verticalCenter: parent.verticalCenter }
            spacing: 14

            Label { text: "Then"; kind: Label.Small; muted: true; anchors.verticalCenter: parent.verticalCenter }
            Icon { name: root.route.afterwards ? root.route.afterwards.icon : ""; size: 30 }
            Label {
                anchors.verticalCenter: parent.verticalCenter
                kind: Label.Small
                text: root.route.afterwards ? root.route.afterwards.street : ""
            }
        }
    }
}
