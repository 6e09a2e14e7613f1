import QtQuick 2.15

Item {
    id: bar
    property var popupData
    Panel {
        anchors { right: parent.right; bottom: parent.bottom; margins: 32; bottomMargin: 104 }
        width: 288; height: 136; radius: 16; color: "#3b82d0"
        title: "Volume " + bar.popupData.eventData.level
        Rectangle { width: 224 * bar.popupData.eventData.level / 30; height: 8; radius: 4 }
    }
}
