import QtQuick 2.15
import "../.."
import "../../controls"

/** Where in the car the sound is, and how it is coloured. */
Page {
    id: root

    readonly property bool centred: Math.abs(Preferences.balance) < 0.01 && Math.abs(Preferences.fader) < 0.01

    title: "Sound"
    actions: [
        TouchButton {
            objectName: "button-centre"
            height: 72
            enabled: !root.centred
            icon: "filter_center_focus"
            text: "Centre"
            onClicked: {
                Preferences.balance = 0
                Preferences.fader = 0
            }
        }
    ]

    Card {
        id: seats
        width: 500
        height: 464
        padding: 0

        SoundStage {
            objectName: "stage"
            anchors.fill: parent
            balance: Preferences.balance
            fader: Preferences.fader
            onMoved: {
                Preferences.balance = balance
                Preferences.fader = fader
            }
        }
    }
    Column {
        anchors { left: seats.right; leftMargin: 24; right: parent.right }
        spacing: Theme.gap

        SettingCard {
            width: parent.width
            height: 148
            title: "Bass"
            value: Math.round(Preferences.bass * 20 - 10)

            SliderBar {
                objectName: "slider-bass"
                anchors { left: parent.left; right: parent.right; bottom: parent.bottom; bottomMargin: -14 }
                centred: true
                value: Preferences.bass
                onMoved: Preferences.bass = value
            }
        }
        SettingCard {
            width: parent.width
            height: 148
            title: "Treble"
            value: Math.round(Preferences.treble * 20 - 10)

            SliderBar {
                objectName: "slider-treble"
                anchors { left: parent.left; right: parent.right; bottom: parent.bottom; bottomMargin: -14 }
                centred: true
                value: Preferences.treble
                onMoved: Preferences.treble = value
            }
        }
        SettingCard {
            width: parent.width
            height: 136
            title: "Key tones"
            hint: "A click for every touch"

            Switch {
                objectName: "switch-key-tones"
                anchors { right: parent.right; verticalCenter: parent.verticalCenter }
                checked: Preferences.keyTones
                onToggled: Preferences.keyTones = checked
            }
        }
    }
}
