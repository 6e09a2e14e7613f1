import QtQuick 2.15
import HmiStateMachine 1.0
import "../.."
import "../../controls"

/** What the search has found, as a list and on the map. */
Page {
    id: root

    readonly property var sent: root.read(root.viewData, "eventData", undefined)
    readonly property string query: root.read(root.sent, "query", "")
    readonly property var found: {
        const named = places.matching(root.query, 3)
        return named.concat([0, 1, 2, 3].filter(i => named.indexOf(i) < 0)).slice(0, 3)
    }

    title: "Results"
    subtitle: root.query === "" ? "3 places nearby" : "3 places for “" + root.query + "”"
    inset: false

    Places { id: places }

    Column {
        anchors { left: parent.left; leftMargin: Theme.margin; top: parent.top; topMargin: 8 }
        spacing: Theme.gap

        Repeater {
            model: root.found

            ResultCard {
                readonly property var place: places.get(modelData)
                objectName: "result-" + index
                width: 540
                sign: "ABC".charAt(index)
                title: place.name
                subtitle: place.detail
                distance: place.distance
                onClicked: Requests.event("Confirm", "touch")
            }
        }
    }
    MapPicture {
        anchors { right: parent.right; top: parent.top; bottom: parent.bottom; topMargin: -96 }
        width: 584
        night: Preferences.nightMap
        following: false
        carShown: true
        zoom: 0.46
        centre: Qt.point(1600, 640)
        pins: root.found.map((place, i) => ({ x: places.get(place).px, y: places.get(place).py, sign: "ABC".charAt(i) }))
    }
}
