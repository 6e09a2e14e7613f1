import QtQuick 2.15
import HmiStateMachine 1.0

Item {
    property string result: "a scene with the effect " + screens.effect

    ScreenHost {
        id: screens
        anchors.fill: parent
    }
}
