import QtQuick 2.15
import HeadUnit 1.0
import ".."

/** A map of the city, with the car, and where asked for the route and the traffic. */
Item {
    id: root

    property bool night: true
    property bool routeShown: false
    property bool trafficShown: false
    property bool namesShown: true
    property bool carShown: true
    property var pins: [] ///< more places to be marked, each with x, y and a sign
    property bool following: true ///< the map moves with the car; otherwise it stays at centre
    property point centre: Qt.point(1200, 750) ///< a place in the city
    property point anchor: Qt.point(0.5, 0.6) ///< where on the picture the car is, 0..1
    property real zoom: 1
    readonly property alias route: way

    readonly property real cameraX: root.following
        ? root.limited(way.position.x * root.zoom - root.anchor.x * root.width, plan.width * root.zoom - root.width)
        : root.centre.x * root.zoom - root.width / 2
    readonly property real cameraY: root.following
        ? root.limited(way.position.y * root.zoom - root.anchor.y * root.height, plan.height * root.zoom - root.height)
        : root.centre.y * root.zoom - root.height / 2

    function limited(value, most) {
        return Math.max(0, Math.min(most, value))
    }

    clip: true
    onVisibleChanged: {
        if (root.visible)
            way.look()
    }

    MapCity { id: plan }
    MapColours { id: paints; night: root.night }
    MapRoute { id: way; city: plan }

    Timer {
        interval: 40
        repeat: true
        running: root.following && root.visible && Vehicle.moving
        onTriggered: way.drive(Vehicle.speed / 3.6 * 0.04)
    }

    Item {
        id: world
        x: -Math.round(root.cameraX)
        y: -Math.round(root.cameraY)

        MapSheet {
            x: root.following ? 0 : Math.round(root.cameraX)
            y: root.following ? 0 : Math.round(root.cameraY)
            width: root.following ? plan.width * root.zoom : root.width
            height: root.following ? plan.height * root.zoom : root.height
            origin: Qt.point(x / root.zoom, y / root.zoom)
            zoom: root.zoom
            city: plan
            colours: paints
            night: root.night
        }
        MapLine {
            visible: root.routeShown
            zoom: root.zoom
            line: root.carShown ? [way.position].concat(way.line.slice(way.index + 1)) : way.line
            thickness: root.zoom > 0.6 ? 13 : 9
            colour: Theme.accent
            edge: paints.routeEdge
            edgeThickness: 3
        }
        Loader {
            active: root.trafficShown
            sourceComponent: MapTraffic {
                city: plan
                zoom: root.zoom
                window: Qt.rect(root.cameraX, root.cameraY, root.width, root.height)
            }
        }
        MapLabels {
            visible: root.namesShown
            city: plan
            colours: paints
            zoom: root.zoom
        }
        MapPin {
            visible: root.routeShown
            x: way.line[way.line.length - 1].x * root.zoom - width / 2
            y: way.line[way.line.length - 1].y * root.zoom - height + 6
        }
        Repeater {
            model: root.pins

            MapPin {
                x: modelData.x * root.zoom - width / 2
                y: modelData.y * root.zoom - height + 6
                sign: modelData.sign
                colour: Theme.accent
            }
        }
        MapArrow {
            visible: root.carShown
            x: way.position.x * root.zoom - width / 2
            y: way.position.y * root.zoom - height / 2
            rotation: way.heading
            colour: Theme.accent
        }
    }
}
