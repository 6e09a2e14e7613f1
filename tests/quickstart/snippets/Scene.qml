import QtQuick 2.15
import HmiStateMachine 1.0

Item {
    width: 800; height: 480

    ScreenHost {
        anchors.fill: parent
        source: "views/%1.qml"     // "Media/Player" is views/Media/Player.qml
        keep: 3
        duration: 200
        easing.type: Easing.InOutQuad
        effect: SceneHost.NoEffect
        errorComponent: Text { property string failedId; text: "no " + failedId }

        ViewComponent { viewId: "Radio"; source: "views/Media/Tuner.qml" }
        ViewComponent {
            viewId: "Home"
            Rectangle {
                color: "black"
                TapHandler { onTapped: Requests.view("Radio", { band: "FM" }) }
            }
        }
    }

    PopupHost {
        anchors.fill: parent
        suppressedLayers: ViewTarget.popupsEnabled ? [] : ["Screens"]
        PopupComponent { popupId: "FuelWarning"; source: "popups/Fuel.qml" }
        PopupComponent {
            kind: 4
            Text {
                property var popupData
                text: popupData.eventData
            }
        }
    }

    Connections {
        target: ViewTarget
        function onLoadFailed(id, file, line, text) { console.warn(id, file, line, text) }
    }

    Repeater {
        model: ViewTarget.shownPopups
        Text { text: model.popupId + (model.covered ? " waits" : " is shown") }
    }
}
