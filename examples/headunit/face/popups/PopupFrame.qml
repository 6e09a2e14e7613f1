import QtQuick 2.15
import HmiStateMachine 1.0
import ".."

/** What all popups share: their data, the surface they are drawn on, and the scrim of modal ones. */
Item {
    id: root

    property string popupId
    property int popupKind: 0
    property var popupData
    property int remainingTime: 0
    property int totalTime: 0

    /** The name that requests go by. */
    property string stateName: root.popupId
    /** Keeps touches from what lies behind. */
    property bool modal: false
    property real scrim: root.modal ? 0.72 : 0

    /** What is left of the popup's time, from 1 to 0; 0 as well when it stays. */
    readonly property real timeLeft: root.totalTime > 0
        ? Math.max(0, Math.min(1, root.remainingTime / root.totalTime)) : 0

    property color surface: Theme.surface
    property color edge: Theme.line
    property int edgeWidth: 1
    property int radius: Theme.radius
    /** A bar along the left edge; transparent for none. */
    property color stripe: "transparent"

    property alias panelX: panel.x
    property alias panelY: panel.y
    property alias panelWidth: panel.width
    property alias panelHeight: panel.height
    default property alias content: inside.data

    function read(key, otherwise) {
        const data = root.popupData ? root.popupData.eventData : undefined;
        return data && data[key] !== undefined ? data[key] : otherwise;
    }

    function dismiss() {
        Requests.dismiss(root.stateName);
    }

    Rectangle {
        anchors.fill: parent
        color: "black"
        opacity: root.scrim
    }

    MouseArea {
        anchors.fill: parent
        enabled: root.modal
    }

    PopupShadow {
        anchors.fill: panel
        radius: root.radius
    }

    Rectangle {
        id: panel

        objectName: "popup-" + root.popupId
        x: Math.round((root.width - width) / 2)
        y: Math.round((root.height - height) / 2)
        radius: root.radius
        color: root.surface
        border.width: root.edgeWidth
        border.color: root.edge

        // Touches beside the buttons are not meant for the screen beneath.
        MouseArea {
            anchors.fill: parent
        }

        Item {
            width: 10
            height: panel.height
            clip: true

            Rectangle {
                width: 2 * root.radius
                height: panel.height
                radius: root.radius
                color: root.stripe
            }
        }

        TimeLeftBar {
            anchors.horizontalCenter: parent.horizontalCenter
            anchors.bottom: parent.bottom
            width: parent.width - 2 * root.radius
            visible: root.totalTime > 0
            share: root.timeLeft
        }

        Item {
            id: inside

            anchors.fill: parent
        }
    }
}
