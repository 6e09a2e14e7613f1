import QtQuick 2.15
import HmiStateMachine 1.0
import ".."

/** The soft keys of the domains below the screen. */
Rectangle {
    id: root

    color: Theme.surface

    Behavior on opacity {
        NumberAnimation { duration: 200 }
    }

    Rectangle {
        width: parent.width
        height: 1
        color: Theme.line
    }

    Row {
        id: row

        anchors.fill: parent
        anchors.leftMargin: Theme.margin
        anchors.rightMargin: Theme.margin

        Repeater {
            model: ViewTarget.domains

            DomainKey {
                width: row.width / ViewTarget.domains.length
                height: row.height
                domain: model.modelData
                current: model.modelData === ViewTarget.activeDomainName
                onClicked: Requests.view(model.modelData)
            }
        }
    }
}
