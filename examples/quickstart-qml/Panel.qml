import QtQuick 2.15

Rectangle {
    property alias title: label.text
    default property alias content: column.data
    color: "#141c26"
    Text { id: label; objectName: "title"; x: 32; y: 32; color: "white"; font.pixelSize: 36 }
    Column { id: column; x: 32; y: 104; spacing: 16 }
}
