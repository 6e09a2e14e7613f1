import QtQuick 2.15

/** The film: a slow ride past mountains and a lake, at the end of a day. */
Item {
    id: root

    property bool running: true

    clip: true

    Rectangle {
        anchors.fill: parent
        gradient: Gradient {
            GradientStop { position: 0; color: "#1c2350" }
            GradientStop { position: 0.32; color: "#5d4a86" }
            GradientStop { position: 0.52; color: "#d9806f" }
            GradientStop { position: 0.66; color: "#fbc98a" }
            GradientStop { position: 1; color: "#fbc98a" }
        }
    }
    Rectangle {
        x: root.width * 0.62
        y: root.height * 0.36
        width: 120
        height: 120
        radius: 60
        color: "#ffe9bf"
    }
    RollingHills {
        anchors { left: parent.left; right: parent.right }
        y: root.height * 0.42
        height: root.height * 0.25
        relief: 150
        shift: 0.7
        period: 1800
        duration: 180000
        near: "#7a5a86"
        far: "#b77a83"
        running: root.running
    }
    RollingHills {
        anchors { left: parent.left; right: parent.right }
        y: root.height * 0.52
        height: root.height * 0.15
        relief: 110
        shift: 2.4
        duration: 100000
        near: "#574a7c"
        far: "#7d5c80"
        running: root.running
    }
    Rectangle {
        id: lake
        anchors { left: parent.left; right: parent.right }
        y: root.height * 0.665
        height: root.height - y
        gradient: Gradient {
            GradientStop { position: 0; color: "#e9a583" }
            GradientStop { position: 0.35; color: "#8a6390" }
            GradientStop { position: 1; color: "#2b2c5c" }
        }

        Repeater {
            model: 9

            Rectangle {
                id: gleam
                readonly property int mid: root.width * 0.62 + 60
                x: gleam.mid - width / 2 + (model.index % 3 - 1) * 14
                y: 6 + model.index * 11
                width: 128 - model.index * 9 + (model.index % 2) * 26
                height: 4
                radius: 2
                color: "#ffe3b4"
                opacity: 0.75 - model.index * 0.07

                SequentialAnimation on opacity {
                    loops: Animation.Infinite
                    paused: !root.running

                    NumberAnimation { to: 0.25; duration: 1400 + model.index * 170; easing.type: Easing.InOutSine }
                    NumberAnimation { to: 0.75 - model.index * 0.06; duration: 1200 + model.index * 130; easing.type: Easing.InOutSine }
                }
            }
        }
    }
    RollingHills {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom }
        height: root.height * 0.33
        relief: 110
        shift: 4.1
        period: 1740
        duration: 34000
        trees: true
        near: "#2b2a4e"
        far: "#14142c"
        running: root.running
    }
}
