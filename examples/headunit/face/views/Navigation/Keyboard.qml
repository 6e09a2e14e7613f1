import QtQuick 2.15
import "../.."

/** Keys to type with, in four rows; letters or digits. */
Column {
    id: root

    property bool digits: false
    readonly property real keyWidth: (root.width - 9 * root.spacing) / 10
    readonly property var rows: root.digits ? ["1234567890", "-/:;()&@+", ".,?!'#\""]
                                            : ["QWERTYUIOP", "ASDFGHJKL", "ZXCVBNM"]

    signal typed(string text)
    signal erased()
    signal searched()

    spacing: 8

    Repeater {
        model: root.rows

        Row {
            id: row
            readonly property string letters: modelData
            readonly property bool last: index === 2
            anchors.horizontalCenter: parent.horizontalCenter
            spacing: root.spacing

            Repeater {
                model: row.letters.length

                KeyboardKey {
                    readonly property string letter: row.letters.charAt(index)
                    objectName: "key-" + letter
                    width: root.keyWidth
                    text: letter
                    onClicked: root.typed(letter)
                }
            }
            KeyboardKey {
                objectName: "key-erase"
                visible: row.last
                width: root.keyWidth * 1.5 + root.spacing
                icon: "backspace"
                special: true
                onClicked: root.erased()
            }
        }
    }
    Row {
        anchors.horizontalCenter: parent.horizontalCenter
        spacing: root.spacing

        KeyboardKey {
            objectName: "key-digits"
            width: root.keyWidth * 1.5
            text: root.digits ? "ABC" : "123"
            special: true
            onClicked: root.digits = !root.digits
        }
        KeyboardKey {
            objectName: "key-space"
            width: root.keyWidth * 6 + root.spacing * 5
            icon: "space_bar"
            onClicked: root.typed(" ")
        }
        KeyboardKey {
            objectName: "key-search"
            width: root.keyWidth * 2.5 + root.spacing * 2
            icon: "search"
            text: "Search"
            primary: true
            onClicked: root.searched()
        }
    }
}
