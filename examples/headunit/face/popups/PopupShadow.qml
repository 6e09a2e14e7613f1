import QtQuick 2.15

/** A soft shadow, drawn as rings that grow fainter, as there are no effects without a GPU. */
Item {
    id: root

    property int radius: 0
    readonly property int rings: 6

    Repeater {
        model: root.rings

        Rectangle {
            readonly property int spread: 4 * (model.index + 1)

            x: -spread
            y: -spread + 8
            width: root.width + 2 * spread
            height: root.height + 2 * spread
            radius: root.radius + spread
            color: "black"
            opacity: 0.09
        }
    }
}
