import QtQuick 2.15

/** A warning for those who build the scene; the host takes it away. */
Rectangle {
    id: root

    property string text

    objectName: "warningBanner"
    anchors { left: parent.left; right: parent.right; bottom: parent.bottom }
    height: label.implicitHeight + 24
    color: "#ffb020"

    Text {
        id: label
        anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter; margins: 16 }
        text: root.text
        textFormat: Text.PlainText
        color: "black"
        font.pixelSize: 22
        wrapMode: Text.Wrap
    }
}
