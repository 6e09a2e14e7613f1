import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import "../.."
import "../../controls"
import "chosen.js" as Chosen

/** Somebody, and the ways to reach them. */
Page {
    id: root

    readonly property var sent: root.read(root.viewData, "eventData", undefined)
    readonly property var contact: book.caller(root.read(root.sent, "contact", Chosen.name))

    title: "Contact"

    function dial(number) {
        Chosen.name = root.contact.name
        Chosen.caller = root.contact.name
        Requests.event("Dial", { number: number })
    }

    ContactBook { id: book }

    Card {
        id: person
        width: 400
        anchors { top: parent.top; bottom: parent.bottom }

        Column {
            anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter }
            spacing: 12

            Avatar {
                anchors.horizontalCenter: parent.horizontalCenter
                width: 190
                name: root.contact.name
                tint: root.contact.tint
            }
            Item { width: 1; height: 8 }
            Label {
                objectName: "contact-name"
                width: parent.width
                horizontalAlignment: Text.AlignHCenter
                kind: Label.Title
                text: root.contact.name
            }
            Row {
                anchors.horizontalCenter: parent.horizontalCenter
                visible: root.contact.favourite
                spacing: 10

                Icon { name: "star"; size: 28; color: Theme.warning }
                Label { text: "Favourite"; kind: Label.Small; muted: true }
            }
        }
    }
    Column {
        anchors { left: person.right; leftMargin: 24; right: parent.right }
        spacing: Theme.gap

        NumberCard {
            objectName: "button-dial-mobile"
            width: parent.width
            visible: root.contact.mobile !== ""
            enabled: Vehicle.phoneConnected
            icon: "smartphone"
            kind: "Mobile"
            number: root.contact.mobile
            onClicked: root.dial(root.contact.mobile)
        }
        NumberCard {
            objectName: "button-dial-work"
            width: parent.width
            visible: root.contact.work !== ""
            enabled: Vehicle.phoneConnected
            icon: "call"
            kind: "Landline"
            number: root.contact.work
            onClicked: root.dial(root.contact.work)
        }
        ListRow {
            width: parent.width
            touchable: false
            icon: "place"
            title: root.contact.town
            subtitle: "Address"
        }
        ListRow {
            width: parent.width
            touchable: false
            icon: "history"
            title: "Today, 17:52"
            subtitle: "Last call, 4 minutes"
            separator: false
        }
    }
}
