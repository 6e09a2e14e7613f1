import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import "../.."
import "../../controls"

/** The first screen of every drive: the time, and a way into each of the domains. */
Page {
    id: root

    readonly property int columnLeft: 352
    readonly property int columnRight: 360

    Clock { id: clock }

    Backdrop { anchors.fill: parent }

    Column {
        x: Theme.margin
        y: 36

        Label {
            objectName: "title"
            text: clock.greeting + ", " + Preferences.driver
            font.weight: Font.Medium
        }
        Label {
            kind: Label.Huge
            text: clock.time
            font.pixelSize: 124
            font.letterSpacing: -5
            height: 136
        }
        Label {
            text: clock.date
            color: Theme.text
            opacity: 0.8
        }
        Item { width: 1; height: 20 }
        Row {
            spacing: 10

            Icon {
                anchors.verticalCenter: parent.verticalCenter
                name: clock.hour < 7 || clock.hour > 19 ? "nights_stay" : "wb_sunny"
                color: Theme.warning
                size: 30
            }
            Label { anchors.verticalCenter: parent.verticalCenter; kind: Label.Small; text: "14 °C" }
            Item { width: 14; height: 1 }
            Icon {
                anchors.verticalCenter: parent.verticalCenter
                name: "local_gas_station"
                color: Vehicle.fuel < 10 ? Theme.warning : Theme.positive
                size: 30
            }
            Label {
                anchors.verticalCenter: parent.verticalCenter
                kind: Label.Small
                text: Math.round(Vehicle.fuel * 7.2) + " km"
            }
        }
    }
    Grid {
        x: Theme.margin
        anchors { bottom: parent.bottom; bottomMargin: Theme.margin }
        columns: 2
        spacing: Theme.gap

        QuickTile { objectName: "tile-apps"; icon: "apps"; title: "Apps"; onClicked: Requests.view("Home/Apps") }
        QuickTile { objectName: "tile-sources"; icon: "radio"; title: "Sources"; onClicked: Requests.view("Media/Sources") }
        QuickTile { objectName: "tile-traffic"; icon: "traffic"; title: "Traffic"; onClicked: Requests.view("Navigation/Traffic") }
        QuickTile { objectName: "tile-settings"; icon: "tune"; title: "Settings"; onClicked: Requests.view("Settings") }
    }
    RouteCard {
        id: route
        objectName: "tile-navigation"
        x: Theme.margin + root.columnLeft + Theme.gap
        y: Theme.margin
        width: root.width - 2 * (Theme.margin + Theme.gap) - root.columnLeft - root.columnRight
        height: root.height - 2 * Theme.margin
        clock: clock
        onClicked: Requests.view("Navigation")
    }
    NowPlayingCard {
        id: playing
        objectName: "tile-media"
        anchors { right: parent.right; rightMargin: Theme.margin; top: route.top }
        width: root.columnRight
        height: 316
        onClicked: Requests.view("Media/Player")
    }
    PhoneCard {
        objectName: "tile-phone"
        anchors { left: playing.left; right: playing.right; top: playing.bottom; topMargin: Theme.gap; bottom: route.bottom }
        onClicked: Requests.view("Phone")
    }
}
