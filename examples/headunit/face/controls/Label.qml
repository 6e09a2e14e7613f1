import QtQuick 2.15
import ".."

/** A line of text in one of the face's few styles. It shortens itself when it has a width. */
Text {
    id: root

    enum Kind { Small, Normal, Title, Huge }

    property int kind: Label.Normal
    property bool muted: false
    property bool strong: root.kind === Label.Title

    color: root.muted ? Theme.secondary : Theme.text
    elide: Text.ElideRight
    font.family: Theme.font
    font.pixelSize: root.kind === Label.Small ? Theme.small
                  : root.kind === Label.Title ? Theme.title
                  : root.kind === Label.Huge ? Theme.huge : Theme.normal
    font.weight: root.kind === Label.Huge ? Font.Light : root.strong ? Font.DemiBold : Font.Normal
    font.letterSpacing: root.kind === Label.Huge ? -2 : root.kind === Label.Title ? -0.5 : 0
    verticalAlignment: Text.AlignVCenter
}
