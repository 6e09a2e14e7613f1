import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import "../.."
import "../../controls"

/** The ways to all that can be set, each with how it is set now. */
Page {
    id: root

    readonly property bool parked: Vehicle.gear === "P"
    readonly property string accentName: {
        const chosen = Preferences.accents.find(accent => Qt.colorEqual(accent.color, Preferences.accent))
        return chosen ? chosen.name : "own colour"
    }

    title: "Settings"

    Grid {
        anchors.fill: parent
        columns: 3
        spacing: Theme.gap

        SettingTile {
            objectName: "tile-display"
            icon: "brightness_6"
            title: "Display"
            subtitle: Math.round(Preferences.brightness * 100) + " %, " + root.accentName
            onClicked: Requests.view("Settings/Display")
        }
        SettingTile {
            objectName: "tile-sound"
            icon: "graphic_eq"
            iconColor: "#b78df7"
            title: "Sound"
            subtitle: Preferences.balance === 0 && Preferences.fader === 0 ? "Centred" : "Moved off centre"
            onClicked: Requests.view("Settings/Sound")
        }
        SettingTile {
            objectName: "tile-devices"
            icon: "bluetooth"
            iconColor: "#6fb1ff"
            title: "Devices"
            subtitle: Vehicle.phoneConnected ? "Mara’s phone" : "No phone connected"
            onClicked: Requests.view("Settings/Devices")
        }
        SettingTile {
            objectName: "tile-update"
            icon: "system_update"
            iconColor: Theme.positive
            title: "Software update"
            subtitle: root.parked ? "Version 4.2 is ready" : "Version 4.2, needs gear P"
            onClicked: Requests.event("StartUpdate")
        }
        SettingTile {
            objectName: "tile-clock"
            icon: "schedule"
            iconColor: Theme.warning
            title: "Clock"
            subtitle: Preferences.use24h ? "24 hours" : "12 hours"
            onClicked: Preferences.use24h = !Preferences.use24h

            Switch {
                anchors.right: parent.right
                checked: Preferences.use24h
                onToggled: Preferences.use24h = checked
            }
        }
        SettingTile {
            objectName: "tile-tones"
            icon: "touch_app"
            iconColor: "#ff8a70"
            title: "Key tones"
            subtitle: Preferences.keyTones ? "On" : "Off"
            onClicked: Preferences.keyTones = !Preferences.keyTones

            Switch {
                anchors.right: parent.right
                checked: Preferences.keyTones
                onToggled: Preferences.keyTones = checked
            }
        }
    }
}
