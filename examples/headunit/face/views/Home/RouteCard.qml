import QtQuick 2.15
import HeadUnit 1.0
import "../.."
import "../../controls"

/** The map around the car; under guidance with the next turn above it and the arrival below. */
Card {
    id: root

    property Clock clock
    readonly property bool guided: Inspector.activeStates.indexOf("Guidance/Running") >= 0
                                   || Inspector.activeStates.indexOf("Guidance/Offer") >= 0
    readonly property MapRoute route: map.route
    readonly property int metres: Math.round(root.route.distanceToTurn / 10) * 10
    readonly property color contentColor: root.guided ? Theme.accentText : Theme.text

    padding: 0
    touchable: true

    // The map covers the lower corners.
    Rectangle {
        anchors { left: parent.left; right: parent.right; top: parent.top; margins: 1 }
        height: top.height + Theme.radius
        radius: Theme.radius
        color: Theme.accent
        visible: root.guided
        opacity: root.pressed ? 0.8 : 1
    }
    Item {
        id: top
        anchors { left: parent.left; right: parent.right; top: parent.top }
        height: 116

        Icon {
            id: turn
            anchors { left: parent.left; leftMargin: 20; verticalCenter: parent.verticalCenter }
            name: root.guided ? root.route.turn.icon : "near_me"
            size: root.guided ? 72 : 52
            color: root.guided ? Theme.accentText : Theme.accent
        }
        Column {
            anchors { left: turn.right; leftMargin: 16; right: parent.right; rightMargin: 12; verticalCenter: parent.verticalCenter }

            Label {
                width: parent.width
                kind: root.guided ? Label.Title : Label.Normal
                strong: true
                text: !root.guided ? "Bridge Street"
                    : root.metres < 1000 ? root.metres + " m" : (root.metres / 1000).toFixed(1) + " km"
                color: root.contentColor
            }
            Label {
                width: parent.width
                kind: Label.Small
                text: root.guided ? root.route.turn.street : "No route guidance"
                color: root.guided ? Theme.accentText : Theme.secondary
            }
        }
    }
    MapPicture {
        id: map
        anchors { left: parent.left; right: parent.right; top: top.bottom; bottom: bottom.top; leftMargin: 1; rightMargin: 1 }
        night: Preferences.nightMap
        routeShown: root.guided
        anchor: Qt.point(0.5, 0.45)
    }
    Item {
        id: bottom
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom }
        height: 100

        Row {
            anchors { left: parent.left; leftMargin: 24; right: parent.right; rightMargin: 12; verticalCenter: parent.verticalCenter }
            visible: root.guided

            Repeater {
                model: [
                    { value: root.clock ? root.clock.timeIn(root.route.minutesLeft) : "", unit: "arrival" },
                    { value: root.route.minutesLeft, unit: "min" },
                    { value: root.route.kilometresLeft.toFixed(1), unit: "km" }
                ]

                Column {
                    width: parent.width * (model.index === 0 ? 0.42 : 0.29)

                    Label {
                        text: modelData.value
                        font { pixelSize: 32; weight: Font.DemiBold }
                    }
                    Label {
                        kind: Label.Small
                        muted: true
                        text: modelData.unit
                    }
                }
            }
        }
        Row {
            anchors.centerIn: parent
            visible: !root.guided
            spacing: 12

            Icon { anchors.verticalCenter: parent.verticalCenter; name: "search"; color: Theme.accent }
            Label { anchors.verticalCenter: parent.verticalCenter; text: "Where to?"; font.weight: Font.Medium }
        }
    }
}
