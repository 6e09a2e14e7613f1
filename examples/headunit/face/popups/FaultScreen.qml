import QtQuick 2.15
import ".."
import "../controls"

/** A critical fault takes the whole area, and only its repair makes it go. */
PopupFrame {
    id: root

    stateName: "car/fault"
    modal: true
    scrim: 1
    radius: 0
    surface: Theme.background
    edge: Theme.critical
    edgeWidth: 8
    panelWidth: root.width
    panelHeight: root.height

    Rectangle {
        anchors.fill: parent
        anchors.margins: 8
        color: Theme.critical
        opacity: 0.07
    }

    Column {
        anchors.centerIn: parent
        width: 840
        spacing: 20

        PopupSign {
            anchors.horizontalCenter: parent.horizontalCenter
            size: 144
            icon: "report_problem"
            ink: Theme.critical
        }

        Label {
            objectName: "popup-title"
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            topPadding: 12
            text: "Stop safely"
            kind: Label.Title
            font.pixelSize: 56
        }

        Label {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            text: "The brake system has a fault. Pull over where it is safe, switch off the engine and call for assistance."
            muted: true
            wrapMode: Text.WordWrap
            lineHeight: 1.3
        }

        Rectangle {
            anchors.horizontalCenter: parent.horizontalCenter
            width: code.implicitWidth + 48
            height: 56
            radius: 28
            color: Theme.raised

            Label {
                id: code

                objectName: "faultCode"
                anchors.centerIn: parent
                text: "Fault code " + root.read("code", 17) + "   ·   Assistance 0800 555 017"
                kind: Label.Small
            }
        }
    }
}
