import QtQuick 2.15
import ".."

/** A button with a text, an icon or both; with an icon alone it can be round. */
Rectangle {
    id: root

    enum Kind { Normal, Primary, Flat, Critical, Positive }

    property string text
    property string icon
    property int kind: TouchButton.Normal
    property int iconSize: 34
    property bool round: false
    property bool checked: false ///< drawn in the accent colour, for something that is switched on
    readonly property bool pressed: touch.pressed
    readonly property bool filled: root.kind !== TouchButton.Normal && root.kind !== TouchButton.Flat
    readonly property color fillColor: root.kind === TouchButton.Primary ? Theme.accent
        : root.kind === TouchButton.Critical ? Theme.critical
        : root.kind === TouchButton.Positive ? Theme.positive
        : root.checked ? Theme.accentSoft
        : root.kind === TouchButton.Flat ? "transparent" : Theme.raised
    property color contentColor: !root.enabled ? Theme.disabled
        : root.kind === TouchButton.Critical ? "#ffffff"
        : root.filled ? Theme.accentText
        : root.checked ? Theme.accent : Theme.text

    signal clicked()

    implicitHeight: Theme.row
    implicitWidth: root.text === "" ? Theme.row : content.width + 64
    radius: root.round ? root.height / 2 : Theme.radius
    color: !root.enabled && root.filled ? Theme.raised
         : !root.pressed ? root.fillColor
         : root.filled ? Qt.darker(root.fillColor, 1.3) : Theme.pressed

    Row {
        id: content
        anchors.centerIn: parent
        spacing: 14

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            visible: root.icon !== ""
            name: root.icon
            size: root.iconSize
            color: root.contentColor
        }
        Label {
            anchors.verticalCenter: parent.verticalCenter
            visible: root.text !== ""
            text: root.text
            color: root.contentColor
            font.weight: Font.Medium
        }
    }

    MouseArea {
        id: touch
        anchors.fill: parent
        onClicked: root.clicked()
    }
}
