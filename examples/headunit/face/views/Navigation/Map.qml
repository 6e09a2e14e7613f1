import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import "../.."
import "../../controls"

/** The map around the car; while there is guidance with the next turn, and on demand with the traffic. */
Page {
    id: root

    readonly property bool trafficShown: root.read(root.viewData, "layer", "") === "traffic"
    readonly property bool offered: Inspector.activeStates.indexOf("Guidance/Offer") >= 0
    readonly property bool guided: Inspector.activeStates.indexOf("Guidance/Running") >= 0 || root.offered

    property int zoomStep: 1
    readonly property var zooms: [0.75, 1, 1.3]

    MapPicture {
        id: map
        anchors.fill: parent
        night: Preferences.nightMap
        routeShown: root.guided
        trafficShown: root.trafficShown
        zoom: root.zooms[root.zoomStep]
        anchor: Qt.point(0.56, 0.46)
    }

    TouchButton {
        id: back
        objectName: "button-back"
        x: 24
        y: 24
        width: 72
        height: 72
        visible: ViewTarget.backPossible
        round: true
        color: back.pressed ? Theme.pressed : Theme.surface
        icon: "arrow_back"
        onClicked: Requests.back()
    }

    MapSearch {
        x: back.visible ? 116 : 24
        y: 24
        visible: !root.guided
        onClicked: Requests.event("SearchDestination")
    }
    MapGuidance {
        objectName: "guidance"
        x: back.visible ? 116 : 24
        y: 24
        visible: root.guided
        route: map.route
    }
    MapArrival {
        anchors { left: parent.left; leftMargin: 24; bottom: parent.bottom; bottomMargin: 24 }
        visible: root.guided
        route: map.route
        delayed: root.trafficShown
        onStopped: Requests.event("StopGuidance")
    }
    MapStreetSign {
        objectName: "street"
        anchors { left: parent.left; leftMargin: 24; bottom: parent.bottom; bottomMargin: 24 }
        visible: !root.guided
        street: map.route.street
    }
    MapLegend {
        anchors { right: parent.right; rightMargin: 24; bottom: parent.bottom; bottomMargin: 24 }
        visible: root.trafficShown
    }

    Column {
        anchors { right: parent.right; rightMargin: 24; top: parent.top; topMargin: 24 }
        spacing: 14

        MapButton {
            objectName: "button-search"
            visible: root.guided
            icon: "search"
            onClicked: Requests.event("SearchDestination")
        }
        MapButton {
            objectName: "button-traffic"
            icon: "traffic"
            on: root.trafficShown
            onClicked: Requests.view(root.trafficShown ? "Navigation/Map" : "Navigation/Traffic")
        }
        MapButton {
            objectName: "button-zoom-in"
            icon: "add"
            enabled: root.zoomStep < root.zooms.length - 1
            onClicked: root.zoomStep += 1
        }
        MapButton {
            objectName: "button-zoom-out"
            icon: "remove"
            enabled: root.zoomStep > 0
            onClicked: root.zoomStep -= 1
        }
    }
}
