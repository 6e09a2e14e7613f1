import QtQuick 2.15
import ".."

/** The frame to the left of the screen that carries the hard keys. */
Rectangle {
    id: root

    property bool lit: true

    readonly property var keys: [
        { key: "Home", icon: "home" },
        { key: "Back", icon: "arrow_back" },
        { key: "Phone", icon: "phone" },
        { key: "Volume", icon: "volume_up" }
    ]

    width: 96
    gradient: Gradient {
        orientation: Gradient.Horizontal
        GradientStop {
            position: 0
            color: Qt.darker(Theme.background, 1.6)
        }
        GradientStop {
            position: 1
            color: Theme.surface
        }
    }

    Column {
        id: column

        anchors.centerIn: parent
        spacing: 24
        opacity: root.lit ? 1 : 0.45

        Behavior on opacity {
            NumberAnimation { duration: 260 }
        }

        Repeater {
            model: root.keys

            HardKey {
                key: model.modelData.key
                icon: model.modelData.icon
            }
        }
    }

    Rectangle {
        anchors.right: parent.right
        width: 1
        height: parent.height
        color: Theme.line
    }
}
