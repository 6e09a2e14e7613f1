import QtQuick 2.15
import ".."

/** Bars that rise and fall as long as the car listens. */
Row {
    id: root

    readonly property var heights: [14, 26, 40, 54, 36, 48, 28, 16]

    height: 56
    spacing: 7

    Repeater {
        model: root.heights

        Rectangle {
            id: bar

            readonly property real full: model.modelData

            anchors.verticalCenter: parent.verticalCenter
            width: 6
            height: full
            radius: 3
            color: Theme.accent

            SequentialAnimation on height {
                running: root.visible
                loops: Animation.Infinite

                NumberAnimation {
                    to: bar.full * 0.35
                    duration: 320 + 60 * (model.index % 3)
                    easing.type: Easing.InOutSine
                }
                NumberAnimation {
                    to: bar.full
                    duration: 320 + 60 * (model.index % 3)
                    easing.type: Easing.InOutSine
                }
            }
        }
    }
}
