import QtQuick 2.15
import "../.."
import "../../controls"

/** A key of the keyboard on the screen. */
TouchButton {
    id: root

    property bool special: false ///< types nothing
    property bool primary: false

    height: 76
    radius: 12
    iconSize: 30
    kind: root.primary ? TouchButton.Primary : TouchButton.Normal
    color: root.pressed ? Theme.accent : root.primary ? Theme.accent : root.special ? Theme.surface : Theme.raised
    opacity: root.primary && !root.enabled ? 0.5 : 1
}
