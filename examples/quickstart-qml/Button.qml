import QtQuick 2.15

Rectangle {
    property alias text: label.text
    signal clicked()
    width: 240; height: 56; radius: 8
    color: area.pressed ? "#3b82d0" : "#2a3a4d"
    Text { id: label; anchors.centerIn: parent; color: "white"; font.pixelSize: 22 }
    MouseArea { id: area; anchors.fill: parent; onClicked: parent.clicked() }
}
