import QtQuick 2.15
import "../.."
import "../../controls"

/** How bright the face is, and in which colours. */
Page {
    id: root

    title: "Display"

    Column {
        id: settings
        width: 600
        spacing: Theme.gap

        SettingCard {
            width: parent.width
            height: 136
            title: "Brightness"
            value: Math.round(Preferences.brightness * 100) + " %"

            SliderBar {
                objectName: "slider-brightness"
                anchors { left: parent.left; right: parent.right; bottom: parent.bottom; bottomMargin: -16 }
                value: Preferences.brightness
                onMoved: Preferences.brightness = value
            }
        }
        SettingCard {
            width: parent.width
            height: 172
            title: "Accent colour"

            Row {
                anchors { left: parent.left; right: parent.right; bottom: parent.bottom; leftMargin: -6 }
                spacing: 34

                Repeater {
                    model: Preferences.accents

                    Swatch {
                        objectName: "accent-" + modelData.name
                        colour: modelData.color
                        chosen: Qt.colorEqual(Preferences.accent, modelData.color)
                        onClicked: Preferences.accent = modelData.color
                    }
                }
            }
        }
        SettingCard {
            width: parent.width
            height: 124
            title: "Night map"
            hint: "Dark streets, easy on the eyes"

            Switch {
                objectName: "switch-night-map"
                anchors { right: parent.right; verticalCenter: parent.verticalCenter }
                checked: Preferences.nightMap
                onToggled: Preferences.nightMap = checked
            }
        }
    }
    Rectangle {
        anchors { left: settings.right; leftMargin: 24; right: parent.right; top: parent.top }
        height: 464
        color: Theme.raised
        border { width: 1; color: Theme.line }

        MapPicture {
            anchors.fill: parent
            anchors.margins: 1
            night: Preferences.nightMap
            following: false
            routeShown: true
            zoom: 0.8
            centre: Qt.point(1240, 830)
        }
    }
}
