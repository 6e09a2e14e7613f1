import QtQuick 2.15
import ".."

/** Something to be on or off. It tells of a touch; what it is bound to has to follow. */
Item {
    id: root

    property bool checked: false

    signal toggled(bool checked)

    implicitWidth: 92
    implicitHeight: 72

    Rectangle {
        anchors.centerIn: parent
        width: 84
        height: 46
        radius: 23
        color: root.checked ? Theme.accent : Theme.pressed
        opacity: root.enabled ? 1 : 0.4

        Behavior on color { ColorAnimation { duration: 120 } }

        Rectangle {
            y: 5
            x: root.checked ? parent.width - width - 5 : 5
            width: 36
            height: 36
            radius: 18
            color: Theme.text

            Behavior on x { NumberAnimation { duration: 120; easing.type: Easing.OutCubic } }
        }
    }
    MouseArea {
        anchors.fill: parent
        onClicked: root.toggled(!root.checked)
    }
}
