import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import ".."

/** Where a back press leads, and what lies behind that. */
PanelSection {
    id: root

    readonly property var stack: Inspector.backStack || []

    title: "Back"
    note: !ViewTarget.backPossible ? "not possible" : ViewTarget.backTarget

    PanelText {
        visible: root.stack.length === 0
        height: 23
        text: ViewTarget.backPossible ? "Nothing lies behind it" : "The stack is empty"
        color: Theme.disabled
    }

    Repeater {
        model: root.stack

        PanelText {
            id: entry

            leftPadding: 28
            width: parent.width
            height: 23
            text: model.modelData
            color: model.index === 0 ? Theme.text : Theme.secondary

            PanelText {
                height: entry.height
                text: model.index + 1
                color: Theme.disabled
            }
        }
    }
}
