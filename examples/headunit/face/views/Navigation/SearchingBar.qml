import QtQuick 2.15
import "../.."

/** Moves to and fro as long as nobody knows how long it takes. */
Rectangle {
    id: root

    property bool running: true

    height: 8
    radius: 4
    color: Theme.pressed

    Rectangle {
        width: root.width / 3
        height: root.height
        radius: root.radius
        color: Theme.accent

        SequentialAnimation on x {
            running: root.running
            loops: Animation.Infinite
            NumberAnimation { from: 0; to: root.width * 2 / 3; duration: 900; easing.type: Easing.InOutQuad }
            NumberAnimation { from: root.width * 2 / 3; to: 0; duration: 900; easing.type: Easing.InOutQuad }
        }
    }
}
