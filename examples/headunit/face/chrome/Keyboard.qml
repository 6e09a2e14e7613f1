import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0

/** Plays the car on a computer's keyboard: hard keys, speed and domains. */
Item {
    id: root

    /** Whether the window is in front; a key released elsewhere is not heard of. */
    property bool active: true

    signal panelsToggled
    signal helpToggled

    readonly property var hardKeys: [homeKey, backKey, phoneKey, volumeKey]

    function hardKey(code) {
        switch (code) {
        case Qt.Key_H:
            return homeKey;
        case Qt.Key_B:
        case Qt.Key_Escape:
        case Qt.Key_Backspace:
            return backKey;
        case Qt.Key_P:
            return phoneKey;
        case Qt.Key_V:
            return volumeKey;
        }
        return null;
    }

    function changeSpeed(difference) {
        Vehicle.speed = Math.max(0, Math.min(220, Vehicle.speed + difference));
    }

    function openDomain(index) {
        if (index < ViewTarget.domains.length) {
            Requests.view(ViewTarget.domains[index]);
        }
    }

    function handle(code) {
        if (code >= Qt.Key_1 && code <= Qt.Key_5) {
            root.openDomain(code - Qt.Key_1);
        } else if (code === Qt.Key_F1) {
            root.helpToggled();
        } else if (code === Qt.Key_F2) {
            root.panelsToggled();
        } else {
            return false;
        }
        return true;
    }

    focus: true
    onActiveChanged: {
        if (!root.active) {
            root.hardKeys.forEach(key => key.abandon());
        }
    }

    Keys.onPressed: {
        const key = root.hardKey(event.key);
        if (key) {
            if (!event.isAutoRepeat) {
                key.press();
            }
            event.accepted = true;
        } else if (event.key === Qt.Key_Up || event.key === Qt.Key_Down) {
            root.changeSpeed(event.key === Qt.Key_Up ? 10 : -10);
            event.accepted = true;
        } else if (!event.isAutoRepeat) {
            event.accepted = root.handle(event.key);
        }
    }
    Keys.onReleased: {
        const key = root.hardKey(event.key);
        if (key && !event.isAutoRepeat) {
            key.release();
            event.accepted = true;
        }
    }

    KeyPress {
        id: homeKey
        key: "Home"
    }
    KeyPress {
        id: backKey
        key: "Back"
    }
    KeyPress {
        id: phoneKey
        key: "Phone"
    }
    KeyPress {
        id: volumeKey
        key: "Volume"
    }
}
