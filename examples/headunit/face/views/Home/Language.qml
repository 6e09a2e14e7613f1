import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"

/** The first question that a new car asks. */
Page {
    id: root

    readonly property var languages: [
        { code: "en", name: "English", hint: "Welcome" },
        { code: "de", name: "Deutsch", hint: "Willkommen" },
        { code: "fr", name: "Français", hint: "Bienvenue" },
        { code: "es", name: "Español", hint: "Bienvenida" },
        { code: "it", name: "Italiano", hint: "Benvenuta" },
        { code: "sv", name: "Svenska", hint: "Välkommen" }
    ]

    // There are no soft keys yet: it goes on to the edge of the display.
    Backdrop {
        anchors { fill: parent; bottomMargin: -80 }
        horizon: 0.8
        strength: 0.7
    }
    Column {
        x: 2 * Theme.margin
        y: 56

        Label {
            objectName: "title"
            kind: Label.Title
            font.pixelSize: 52
            text: "Choose your language"
        }
        Label {
            muted: true
            text: "For the display, the voice and the messages"
        }
    }
    Grid {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: 2 * Theme.margin }
        columns: 3
        spacing: Theme.gap

        Repeater {
            model: root.languages

            Card {
                id: choice
                objectName: "button-" + modelData.code
                width: (root.width - 4 * Theme.margin - 2 * Theme.gap) / 3
                height: 140
                touchable: true
                color: pressed ? Theme.pressed : Theme.raised
                border.color: Preferences.language === modelData.code ? Theme.accent : Theme.line
                border.width: Preferences.language === modelData.code ? 2 : 1
                onClicked: {
                    Preferences.language = modelData.code
                    Requests.event("LanguageChosen", modelData.code)
                }

                Column {
                    anchors.verticalCenter: parent.verticalCenter
                    spacing: 2

                    Label { text: modelData.name; font.pixelSize: 34; font.weight: Font.Medium }
                    Label { kind: Label.Small; muted: true; text: modelData.hint }
                }
                Icon {
                    anchors { right: parent.right; verticalCenter: parent.verticalCenter }
                    name: Preferences.language === modelData.code ? "check_circle" : "chevron_right"
                    size: 40
                    color: Preferences.language === modelData.code ? Theme.accent : Theme.secondary
                }
            }
        }
    }
}
