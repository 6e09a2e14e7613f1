import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import "../.."
import "../../controls"

/** Everything the car has to offer, in one grid. */
Page {
    id: root

    readonly property var apps: [
        { name: "music", title: "Music", icon: "library_music", color: "#e86f8b", view: "Media/Player" },
        { name: "sources", title: "Sources", icon: "radio", color: "#e86f8b", view: "Media/Sources" },
        { name: "phone", title: "Phone", icon: "phone", color: "#4ccf9a", view: "Phone" },
        { name: "contacts", title: "Contacts", icon: "contacts", color: "#4ccf9a", view: "Phone/Contacts" },
        { name: "map", title: "Map", icon: "navigation", color: "#3da9fc", view: "Navigation/Map" },
        { name: "traffic", title: "Traffic", icon: "traffic", color: "#3da9fc", view: "Navigation/Traffic" },
        { name: "settings", title: "Settings", icon: "settings", color: "#9aa7b5", view: "Settings/Main" },
        { name: "display", title: "Display", icon: "brightness_6", color: "#f5b14c", view: "Settings/Display" },
        { name: "sound", title: "Sound", icon: "equalizer", color: "#f5b14c", view: "Settings/Sound" },
        { name: "devices", title: "Devices", icon: "devices", color: "#a99bff", view: "Settings/Devices" },
        { name: "home", title: "Home", icon: "home", color: "#a99bff", view: "Home/Main" },
        { name: "display-off", title: "Display off", icon: "bedtime", color: "#9aa7b5", view: "" }
    ]

    title: "Apps"

    Grid {
        id: grid
        readonly property real cellWidth: (width - 5 * spacing) / 6
        readonly property real cellHeight: (height - spacing) / 2
        anchors.fill: parent
        columns: 6
        spacing: Theme.gap

        Repeater {
            model: root.apps

            AppTile {
                objectName: "tile-" + modelData.name
                width: grid.cellWidth
                height: grid.cellHeight
                icon: modelData.icon
                title: modelData.title
                iconColor: modelData.color
                onClicked: modelData.view !== "" ? Requests.view(modelData.view) : Requests.event("DisplayOff")
            }
        }
    }
}
