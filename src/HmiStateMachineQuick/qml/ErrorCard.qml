import QtQuick 2.15

/** Stands in the place of what cannot be loaded, and tells which, where and why. */
Rectangle {
    id: root

    property string failedId
    property url file
    property int line
    property string text

    objectName: "errorCard"
    color: "#2b0f12"
    border.color: "#ff4d4f"
    border.width: 4

    Column {
        anchors.centerIn: parent
        width: root.width * 0.8
        spacing: 16

        Text {
            objectName: "errorTitle"
            width: parent.width
            text: qsTr("“%1” cannot be shown").arg(root.failedId)
            textFormat: Text.PlainText
            color: "white"
            font.pixelSize: 32
            font.bold: true
            wrapMode: Text.Wrap
        }

        Text {
            objectName: "errorPlace"
            width: parent.width
            visible: text.length > 0
            text: root.line < 0 ? root.file : root.file + ":" + root.line
            textFormat: Text.PlainText
            color: "#ffb3b4"
            font.pixelSize: 22
            wrapMode: Text.WrapAnywhere
        }

        Text {
            objectName: "errorText"
            width: parent.width
            text: root.text
            textFormat: Text.PlainText
            color: "white"
            font.pixelSize: 22
            wrapMode: Text.Wrap
        }
    }
}
