import QtQuick 2.15
import ".."

/** The time of day, as text and as what is said at that time. */
Item {
    id: root

    property date now: new Date()
    readonly property string time: Qt.formatTime(root.now, Preferences.clockFormat).replace(/ [AP]M$/, "")
    readonly property string date: root.now.toLocaleDateString(Qt.locale("en_GB"), "dddd, d MMMM")
    readonly property int hour: root.now.getHours()
    readonly property string greeting: root.hour < 5 ? "Good evening" : root.hour < 12 ? "Good morning"
                                     : root.hour < 18 ? "Good afternoon" : "Good evening"

    /** The time of day in so many minutes from now. */
    function timeIn(minutes) {
        return Qt.formatTime(new Date(root.now.getTime() + minutes * 60000), Preferences.clockFormat)
    }

    Timer {
        interval: 1000
        repeat: true
        running: true
        onTriggered: root.now = new Date()
    }
}
