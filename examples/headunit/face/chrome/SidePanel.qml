import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import ".."

/** What the state machine is doing, beside the display, for those who develop for it. */
Rectangle {
    id: root

    color: Theme.background

    Rectangle {
        width: 1
        height: parent.height
        color: Theme.line
    }

    Flickable {
        id: area

        anchors.fill: parent
        clip: true
        contentHeight: sections.height
        boundsBehavior: Flickable.StopAtBounds

        Column {
            id: sections

            width: area.width

            PanelText {
                x: 20
                height: 55
                text: ViewTarget.activeView
                font.pixelSize: 20
                font.weight: Font.DemiBold
            }

            StatesSection {
                width: parent.width
            }

            BackSection {
                width: parent.width
            }

            PopupsSection {
                width: parent.width
            }

            RequestsSection {
                width: parent.width
            }
        }
    }
}
