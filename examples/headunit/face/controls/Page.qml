import QtQuick 2.15
import ".."

/** What the screens are made of: ground, header and the area below it, and what the host tells them. */
Rectangle {
    id: root

    property string viewId
    property var viewData
    property var activationData

    property string title ///< without one there is no header, and the content takes the whole screen
    property string subtitle
    property bool inset: root.title !== "" ///< keeps the content off the edges
    property alias actions: header.content ///< stands at the right of the header
    default property alias content: inside.data

    /** What the data say under a key, or otherwise the value that is given. */
    function read(data, key, otherwise) {
        return data && data[key] !== undefined ? data[key] : otherwise
    }

    implicitWidth: 1184
    implicitHeight: 584
    color: Theme.background

    ScreenHeader {
        id: header
        anchors { left: parent.left; right: parent.right; top: parent.top }
        visible: root.title !== ""
        title: root.title
        subtitle: root.subtitle
    }
    Item {
        id: inside
        anchors {
            left: parent.left
            right: parent.right
            top: root.title !== "" ? header.bottom : parent.top
            bottom: parent.bottom
            leftMargin: root.inset ? Theme.margin : 0
            rightMargin: root.inset ? Theme.margin : 0
            bottomMargin: root.inset ? 24 : 0
        }
    }
}
