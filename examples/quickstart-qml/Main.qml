import QtQuick 2.15
import QtQuick.Window 2.15
import HmiStateMachine 1.0

Window {
    id: window
    property int volume: 12
    function changeVolume(step) {
        volume = Math.max(0, Math.min(30, volume + step))
        Requests.popup("Volume", { level: volume })
    }

    width: 800; height: 480; visible: true
    ScreenHost { anchors.fill: parent; source: "%1.qml" }
    Button {
        anchors { left: parent.left; bottom: parent.bottom; margins: 32 }
        text: "‹ Back"
        visible: ViewTarget.backPossible
        onClicked: Requests.back()
    }
    PopupHost {
        anchors.fill: parent
        PopupComponent { popupId: "TurnOff"; source: "Question.qml" }
        PopupComponent { popupId: "Volume"; VolumeBar { } }
    }
    Row {
        anchors { right: parent.right; bottom: parent.bottom; margins: 32 }
        spacing: 16
        Button { text: "Vol −"; width: 136; onClicked: window.changeVolume(-1) }
        Button { text: "Vol +"; width: 136; onClicked: window.changeVolume(1) }
    }
}
