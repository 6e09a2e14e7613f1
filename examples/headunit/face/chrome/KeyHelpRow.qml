import QtQuick 2.15
import ".."
import "../controls"

/** What one or several keys of the computer do. */
Item {
    id: root

    property var keys: []
    property string meaning

    height: 52

    Row {
        id: caps

        anchors.verticalCenter: parent.verticalCenter
        spacing: 8

        Repeater {
            model: root.keys

            Rectangle {
                readonly property bool between: model.modelData === "…"

                width: Math.max(40, cap.implicitWidth + 24)
                height: 40
                radius: 8
                color: between ? "transparent" : Theme.raised
                border.color: between ? "transparent" : Theme.line

                Label {
                    id: cap

                    anchors.centerIn: parent
                    text: model.modelData
                    kind: Label.Small
                }
            }
        }
    }

    Label {
        x: 180
        anchors.verticalCenter: parent.verticalCenter
        text: root.meaning
        kind: Label.Small
        muted: true
    }
}
