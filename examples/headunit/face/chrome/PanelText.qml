import QtQuick 2.15
import ".."

/** Text of the panels beside the display, which are read at a desk. */
Text {
    color: Theme.text
    font.family: Theme.font
    font.pixelSize: 16
    elide: Text.ElideRight
    verticalAlignment: Text.AlignVCenter
}
