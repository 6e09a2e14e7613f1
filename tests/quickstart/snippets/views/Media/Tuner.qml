import QtQuick 2.15
import HmiStateMachine 1.0

Rectangle {
    id: screen
    property string viewId
    property var viewData
    property var activationData

    x: width * ScreenHost.position
    opacity: 1 - Math.abs(ScreenHost.position)
    Text { text: screen.viewId + " " + screen.viewData.eventData.band }
}
