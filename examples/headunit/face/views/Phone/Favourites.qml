import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"
import "chosen.js" as Chosen

/** Whom the driver calls most. */
Page {
    id: root

    title: "Favourites"
    actions: [
        TouchButton {
            objectName: "button-contacts"
            height: 72
            icon: "contacts"
            text: "Contacts"
            onClicked: Requests.view("Phone/Contacts")
        }
    ]

    ContactBook { id: book }

    Grid {
        anchors.fill: parent
        columns: 3
        spacing: Theme.gap

        Repeater {
            model: book.favourites()

            FavouriteCard {
                readonly property var contact: book.get(modelData)
                objectName: "favourite-" + index
                width: (1120 - 2 * Theme.gap) / 3
                height: (464 - Theme.gap) / 2
                name: contact.name
                tint: contact.tint
                number: contact.mobile !== "" ? contact.mobile : contact.work
                onClicked: {
                    Chosen.name = contact.name
                    Requests.view("Phone/ContactDetails", { contact: contact.name })
                }
            }
        }
    }
}
