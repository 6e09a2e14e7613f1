import QtQuick 2.15

/** Rings that go out from somewhere, as long as it rings. */
Item {
    id: root

    property color tint
    property bool running: true
    property real inner: 160
    property real reach: 110

    Repeater {
        model: 3

        Rectangle {
            id: ring
            property real spread: index / 3

            anchors.centerIn: parent
            width: root.inner + root.reach * ring.spread
            height: ring.width
            radius: ring.width / 2
            color: "transparent"
            border { width: 3; color: root.tint }
            opacity: 0.7 * (1 - ring.spread)

            SequentialAnimation on spread {
                running: root.running
                loops: Animation.Infinite
                NumberAnimation { from: index / 3; to: 1; duration: 2400 * (1 - index / 3) }
                NumberAnimation { from: 0; to: index / 3; duration: 2400 * index / 3 }
            }
        }
    }
}
