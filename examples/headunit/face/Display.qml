import QtQuick 2.15
import HmiStateMachine 1.0
import "."
import "chrome"
import "controls"

/** The display of the car, 1280 x 720, with the keys that are built in beside it. */
Rectangle {
    id: root

    readonly property string view: ViewTarget.activeView
    readonly property bool dark: root.view === "Home/Standby"
    /** Screens that have the display to themselves. */
    readonly property bool alone: root.dark || root.view === ""
        || root.view === "Home/Welcome" || root.view === "Home/Language"

    implicitWidth: 1280
    implicitHeight: 720
    color: root.dark ? "black" : Theme.background

    Behavior on color {
        ColorAnimation { duration: 260 }
    }

    // The dark display is one surface: it wakes wherever it is touched.
    MouseArea {
        anchors.fill: parent
        enabled: root.dark
        onClicked: Requests.view("Home/Main")
    }

    // Paints the map ahead of the first screen that shows it, beside what is to be seen.
    Loader {
        x: root.width
        active: root.view === "" || root.view === "Home/Welcome" || root.view === "Home/Language"
        sourceComponent: MapSheet {
            id: sheet

            width: city.width
            height: city.height
            city: MapCity {
                id: city
            }
            colours: MapColours {
                night: sheet.night
            }
            night: Preferences.nightMap
            hurried: false
        }
    }

    ScreenHost {
        id: screenHost

        objectName: "screenHost"
        source: "views/%1.qml"
        keep: 0
        duration: 260
        // A screen without soft keys goes on below them.
        clip: false
        anchors {
            left: bezel.right
            right: parent.right
            top: statusBar.bottom
            bottom: domainBar.top
        }
    }

    StatusBar {
        id: statusBar

        anchors.left: bezel.right
        anchors.right: parent.right
        height: 56
        titleShown: !root.alone
        opacity: root.dark ? 0 : 1
    }

    DomainBar {
        id: domainBar

        anchors.left: bezel.right
        anchors.right: parent.right
        anchors.bottom: parent.bottom
        height: 80
        enabled: !root.alone && root.view !== "Home/RearCamera"
        opacity: root.alone ? 0 : domainBar.enabled ? 1 : 0.3
    }

    OfferBar {
        objectName: "offer"
        anchors.horizontalCenter: screenHost.horizontalCenter
        anchors.bottom: domainBar.top
        // The map tells there when the car arrives.
        anchors.bottomMargin: root.view === "Navigation/Map" ? 148 : 20
        enabled: !root.alone
    }

    Popups {
        id: popupHost

        objectName: "popupHost"
        anchors {
            left: bezel.right
            right: parent.right
            top: parent.top
            bottom: parent.bottom
        }
    }

    Hint {
        objectName: "hint"
        anchors.horizontalCenter: screenHost.horizontalCenter
        anchors.bottom: domainBar.top
        anchors.bottomMargin: 20
    }

    HardKeyBezel {
        id: bezel

        lit: !root.dark
        height: parent.height
    }

    Rectangle {
        id: dimmer

        anchors.fill: parent
        color: "black"
        opacity: 0.6 * Math.pow(1 - Preferences.brightness, 2)
    }
}
