import QtQuick 2.15
import QtQuick.Window 2.15
import "."
import "chrome"
import "controls"

/** The window: the display, and beside it the panels of those who develop for it. */
Window {
    id: root

    property bool panelsShown: false

    objectName: "window"
    title: "Head unit"
    visible: true
    color: "black"
    width: scene.width
    height: scene.height

    Item {
        id: scene

        anchors.centerIn: parent
        width: root.panelsShown ? 1700 : 1280
        height: root.panelsShown ? 900 : 720
        scale: Math.min(root.width / scene.width, root.height / scene.height)

        Display {
            id: display

            width: 1280
            height: 720
            clip: true
        }

        Loader {
            active: root.panelsShown
            x: display.width
            width: 420
            height: scene.height
            source: "chrome/SidePanel.qml"
        }

        Loader {
            active: root.panelsShown
            y: display.height
            width: display.width
            height: 180
            source: "chrome/VehiclePanel.qml"
        }

        PanelHandle {
            id: handle

            objectName: "button-panels"
            anchors.right: display.right
            anchors.verticalCenter: display.verticalCenter
            open: root.panelsShown
            onClicked: root.panelsShown = !root.panelsShown
        }

        KeyHelp {
            id: keyHelp

            objectName: "keyHelp"
            anchors.fill: display
            visible: false
            onClicked: keyHelp.visible = false
        }
    }

    Keyboard {
        id: keyboard

        active: root.active
        onPanelsToggled: root.panelsShown = !root.panelsShown
        onHelpToggled: keyHelp.visible = !keyHelp.visible
    }
}
