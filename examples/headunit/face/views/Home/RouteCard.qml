import QtQuick 2.15
import HeadUnit 1.0
import "../.."
import "../../controls"

/** The map around the car; under guidance also the next turn and the arrival. */
Card {
    id: root

    property Clock clock
    readonly property bool guided: Inspector.activeStates.indexOf("Guidance/Running") >= 0

    padding: 0
    touchable: true

    RouteMap {
        anchors.fill: parent
        anchors.margins: 1
        opacity: root.pressed ? 0.7 : 1
        routed: root.guided
    }
    Rectangle {
        anchors { left: parent.left; right: parent.right; top: parent.top; margins: 16 }
        height: 104
        radius: 16
        color: root.guided ? Theme.accent : Theme.raised

        Icon {
            id: turn
            anchors { left: parent.left; leftMargin: 16; verticalCenter: parent.verticalCenter }
            name: root.guided ? "turn_right" : "near_me"
            size: root.guided ? 64 : 44
            color: root.guided ? Theme.accentText : Theme.accent
        }
        Column {
            anchors { left: turn.right; leftMargin: 12; right: parent.right; rightMargin: 12; verticalCenter: parent.verticalCenter }

            Label {
                width: parent.width
                kind: root.guided ? Label.Title : Label.Normal
                strong: true
                text: root.guided ? "350 m" : "Linden Avenue"
                color: root.guided ? Theme.accentText : Theme.text
            }
            Label {
                width: parent.width
                kind: Label.Small
                text: root.guided ? "Harbour Street" : "No route guidance"
                color: root.guided ? Theme.accentText : Theme.secondary
            }
        }
    }
    Rectangle {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: 16 }
        height: 88
        radius: 16
        color: Theme.raised

        Row {
            anchors { left: parent.left; leftMargin: 20; right: parent.right; rightMargin: 12; verticalCenter: parent.verticalCenter }
            visible: root.guided

            Repeater {
                model: [
                    { value: root.clock ? root.clock.timeIn(34) : "", unit: "arrival" },
                    { value: "34", unit: "min" },
                    { value: "28", unit: "km" }
                ]

                Column {
                    width: parent.width * (model.index === 0 ? 0.44 : 0.28)

                    Label {
                        text: modelData.value
                        font.weight: Font.DemiBold
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
