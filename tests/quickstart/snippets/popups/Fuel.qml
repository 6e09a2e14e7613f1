import QtQuick 2.15

Item {
    id: popup
    property int remainingTime
    property int totalTime

    Rectangle {
        width: popup.totalTime > 0 ? 400 * popup.remainingTime / popup.totalTime : 0
        height: 4
    }
}
