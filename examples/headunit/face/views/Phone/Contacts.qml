import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"
import "chosen.js" as Chosen

/** All contacts of the phone, and the last calls. */
Page {
    id: root

    title: "Contacts"
    subtitle: book.count + " from Mara’s phone"

    function open(name) {
        Chosen.name = name
        Requests.event("Confirm", "touch")
    }

    ContactBook { id: book }

    TouchList {
        id: list
        objectName: "contacts"
        width: 640
        anchors { top: parent.top; bottom: parent.bottom }
        model: book
        delegate: ListRow {
            objectName: "contact-" + index
            width: list.width - 20
            title: model.name
            subtitle: model.mobile !== "" ? model.mobile : model.work
            chevron: true
            leading: Avatar {
                name: model.name
                tint: model.tint
            }
            onClicked: root.open(model.name)
        }
    }
    Card {
        anchors { left: list.right; leftMargin: 24; right: parent.right; top: parent.top; bottom: parent.bottom }
        padding: 12

        Label {
            x: 20
            y: 12
            kind: Label.Small
            muted: true
            text: "Recent calls"
        }
        Column {
            anchors { left: parent.left; right: parent.right; top: parent.top; topMargin: 54 }

            Repeater {
                model: [
                    { name: "Ann Marlow", when: "Today, 17:52", icon: "call_received", missed: false },
                    { name: "Office", when: "Today, 16:30", icon: "call_made", missed: false },
                    { name: "Ben Tarrow", when: "Today, 12:08", icon: "call_missed", missed: true },
                    { name: "Edda Quill", when: "Yesterday", icon: "call_made", missed: false }
                ]

                ListRow {
                    objectName: "recent-" + index
                    width: parent.width
                    icon: modelData.icon
                    iconColor: modelData.missed ? Theme.critical : Theme.secondary
                    title: modelData.name
                    subtitle: modelData.when
                    separator: index < 3
                    onClicked: root.open(modelData.name)
                }
            }
        }
    }
}
