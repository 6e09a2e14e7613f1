import QtQuick 2.15
import ".."

/** A symbol of the icon font, chosen by its ligature, in a square of its size. */
Text {
    id: root

    property string name
    property int size: 32

    width: root.size
    height: root.size
    text: root.name
    color: Theme.text
    font.family: Theme.icons
    font.pixelSize: root.size
    horizontalAlignment: Text.AlignHCenter
    verticalAlignment: Text.AlignVCenter
}
