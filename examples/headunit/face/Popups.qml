import QtQuick 2.15
import HmiStateMachine 1.0

/** Shows each popup with what was drawn for it, and others with what all of their kind share. */
PopupHost {
    id: root

    // The screens' popups stay away where a view has switched them off; alerts do not.
    suppressedLayers: ViewTarget.popupsEnabled ? [] : ["Screens"]

    PopupComponent {
        popupId: "CallBanner"
        source: "popups/CallBanner.qml"
    }
    PopupComponent {
        popupId: "FuelWarning"
        source: "popups/FuelWarning.qml"
    }
    PopupComponent {
        popupId: "FaultScreen"
        source: "popups/FaultScreen.qml"
    }
    PopupComponent {
        popupId: "navigation/traffic"
        source: "popups/TrafficPopup.qml"
    }
    PopupComponent {
        popupId: "system/update"
        source: "popups/UpdatePopup.qml"
    }
    PopupComponent {
        popupId: "system/voice"
        source: "popups/VoicePopup.qml"
    }
    PopupComponent {
        popupId: "media/volume"
        source: "popups/VolumePopup.qml"
    }
    PopupComponent {
        popupId: "car/speed"
        source: "popups/SpeedPopup.qml"
    }
    PopupComponent {
        popupId: "car/parking"
        source: "popups/ParkingPopup.qml"
    }
    PopupComponent {
        kind: 2
        source: "popups/NotePopup.qml"
    }
    PopupComponent {
        kind: 3
        source: "popups/QuestionPopup.qml"
    }
    PopupComponent {
        kind: 4
        source: "popups/WarningPopup.qml"
    }
    PopupComponent {
        kind: 5
        source: "popups/OverlayPopup.qml"
    }
}
