import QtQuick 2.15
import ".."

/** The ground of a map as a picture, which is painted only when there is none of it yet. */
Item {
    id: root

    property MapCity city
    property MapColours colours
    property real zoom: 1
    property point origin: Qt.point(0, 0) ///< the place in the city of the upper left corner
    property bool night: true
    property bool hurried: true ///< someone waits for it; otherwise it is painted beside all else

    readonly property string key: [root.width, root.height, root.origin.x, root.origin.y, root.zoom, root.night].join()
    property string picture
    property bool complete: false

    function choose() {
        if (root.complete && root.width > 0 && root.height > 0)
            root.picture = MapStore.picture(root.key)
    }

    onKeyChanged: root.choose()
    Component.onCompleted: {
        root.complete = true
        root.choose()
    }

    Image {
        source: root.picture
        smooth: false
    }
    Loader {
        active: root.complete && root.picture === ""
        sourceComponent: MapGround {
            id: ground
            width: root.width
            height: root.height
            origin: root.origin
            zoom: root.zoom
            city: root.city
            colours: root.colours
            night: root.night
            renderStrategy: root.hurried ? Canvas.Immediate : Canvas.Threaded
            onPainted: MapStore.keep(root.key, ground)
        }
    }
}
