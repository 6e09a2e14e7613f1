import QtQuick 2.15
import "../.."
import "../../controls"

/** The car from above, with a point to be moved to where the sound shall be. */
Item {
    id: root

    property real balance: 0 ///< -1 left .. 1 right
    property real fader: 0 ///< -1 rear .. 1 front

    signal moved(real balance, real fader)

    CarPlan {
        id: car
        anchors.centerIn: parent
        width: 236
        height: 428
        body: Theme.raised
        glass: Theme.background
        seat: Theme.pressed
        line: Theme.line
    }
    Repeater {
        model: [[-1, -1], [1, -1], [-1, 1], [1, 1]]

        Icon {
            readonly property real level: Math.max(0, 1 - Math.hypot(modelData[0] - root.balance, modelData[1] + root.fader) / 2.83)
            x: root.width / 2 + modelData[0] * 176 - width / 2
            y: root.height / 2 + modelData[1] * 92 + 20 - height / 2
            name: "speaker"
            size: 52
            color: Theme.accent
            opacity: 0.25 + 0.75 * level
        }
    }
    Rectangle {
        id: point
        x: root.width / 2 + root.balance * 86 - width / 2
        y: root.height / 2 + 20 - root.fader * 120 - height / 2
        width: 132
        height: 132
        radius: 66
        color: Theme.accentSoft
        border { width: 2; color: Theme.accent }

        Rectangle {
            anchors.centerIn: parent
            width: 36
            height: 36
            radius: 18
            color: Theme.text
        }
    }
    MouseArea {
        id: touch

        function limited(value) {
            return Math.abs(value) < 0.08 ? 0 : Math.max(-1, Math.min(1, value))
        }

        function report(x, y) {
            root.moved(touch.limited((x - root.width / 2) / 86), touch.limited((root.height / 2 + 20 - y) / 120))
        }

        anchors.fill: parent
        preventStealing: true
        onPressed: touch.report(mouse.x, mouse.y)
        onPositionChanged: touch.report(mouse.x, mouse.y)
    }
}
