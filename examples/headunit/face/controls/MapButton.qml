import QtQuick 2.15
import ".."

/** A round button on a map, opaque so that its sign can be read on any ground. */
TouchButton {
    id: root

    property bool on: false

    width: 76
    height: 76
    round: true
    color: root.pressed ? Theme.pressed : root.on ? Theme.accent : Theme.surface
    contentColor: !root.enabled ? Theme.disabled : root.on ? Theme.accentText : Theme.text
    border { width: 1; color: root.on ? Theme.accent : Theme.line }
}
