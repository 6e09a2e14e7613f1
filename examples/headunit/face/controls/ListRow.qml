import QtQuick 2.15
import ".."

/** A line of a list. What is put into it stands at its right end, such as a switch. */
Rectangle {
    id: root

    property string icon
    property color iconColor: Theme.secondary
    property Component leading ///< takes the icon's place, for a cover or a picture
    property string title
    property string subtitle
    property string trailing
    property bool chevron: false
    property bool selected: false
    property bool separator: true
    property bool touchable: true
    default property alias content: slot.data

    signal clicked()

    implicitWidth: 600
    implicitHeight: 88
    radius: Theme.radius
    color: touch.pressed ? Theme.pressed : root.selected ? Theme.accentSoft : "transparent"

    MouseArea {
        id: touch
        anchors.fill: parent
        enabled: root.touchable
        onClicked: root.clicked()
    }
    Rectangle {
        anchors { left: texts.left; right: parent.right; bottom: parent.bottom; rightMargin: 20 }
        height: 1
        color: Theme.line
        visible: root.separator && !root.selected && !touch.pressed
    }
    Icon {
        anchors { left: parent.left; leftMargin: 20; verticalCenter: parent.verticalCenter }
        visible: root.icon !== "" && !root.leading
        name: root.icon
        size: 36
        color: root.selected ? Theme.accent : root.iconColor
    }
    Loader {
        id: leadingLoader
        anchors { left: parent.left; leftMargin: 16; verticalCenter: parent.verticalCenter }
        sourceComponent: root.leading
    }
    Column {
        id: texts
        anchors {
            left: parent.left
            leftMargin: root.leading ? leadingLoader.width + 36 : root.icon !== "" ? 80 : 20
            right: slot.left
            rightMargin: 16
            verticalCenter: parent.verticalCenter
        }

        Label {
            objectName: "row-title"
            width: parent.width
            text: root.title
            font.weight: Font.Medium
            color: !root.enabled ? Theme.disabled : root.selected ? Theme.accent : Theme.text
        }
        Label {
            width: parent.width
            visible: root.subtitle !== ""
            kind: Label.Small
            muted: true
            text: root.subtitle
        }
    }
    Row {
        id: slot
        anchors { right: end.left; rightMargin: end.width > 0 ? 12 : 0; verticalCenter: parent.verticalCenter }
        spacing: Theme.gap
    }
    Row {
        id: end
        anchors { right: parent.right; rightMargin: 20; verticalCenter: parent.verticalCenter }
        spacing: 8

        Label {
            anchors.verticalCenter: parent.verticalCenter
            visible: root.trailing !== ""
            kind: Label.Small
            muted: true
            text: root.trailing
        }
        Icon {
            anchors.verticalCenter: parent.verticalCenter
            visible: root.chevron
            name: "chevron_right"
            color: Theme.secondary
        }
    }
}
