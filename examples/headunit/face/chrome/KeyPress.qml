import QtQuick 2.15
import HmiStateMachine 1.0

/**
 * A hard key from its press to its release, which tells a short press from a held one: the flow
 * hears of a short press when it is over, and of a held one while the key is still down.
 */
QtObject {
    id: root

    property string key
    property bool pressed: false
    property bool held: false

    readonly property Timer holding: Timer {
        interval: 700
        onTriggered: {
            root.held = true;
            Requests.key(root.key, 2);
        }
    }

    function press() {
        if (root.pressed) {
            return;
        }
        root.pressed = true;
        root.held = false;
        root.holding.restart();
    }

    function release() {
        root.end(true);
    }

    /** The finger slid off, or the window lost the keyboard: what has not been told is not meant. */
    function abandon() {
        root.end(false);
    }

    function end(meant) {
        if (!root.pressed) {
            return;
        }
        const wasHeld = root.held;
        root.holding.stop();
        root.pressed = false;
        root.held = false;
        if (meant && !wasHeld) {
            Requests.key(root.key, 1);
        }
        if (meant || wasHeld) {
            Requests.key(root.key, 0);
        }
    }
}
