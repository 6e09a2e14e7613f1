import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import ".."

/** The states that are active, indented as they lie in the tree. */
PanelSection {
    id: root

    readonly property var states: Inspector.activeStates || []
    readonly property var regions: ["Screens", "Alerts", "Guidance", "Audio", "Keys"]

    /** Names tell the depth: the machine, its regions, their domains, and what has a path for a name. */
    function depth(name, index) {
        if (index === 0) {
            return 0;
        }
        if (root.regions.includes(name)) {
            return 1;
        }
        return ViewTarget.domains.includes(name.split("/")[0]) && name.includes("/") ? 3 : 2;
    }

    title: "Active states"
    note: root.states.length

    Repeater {
        model: root.states

        PanelText {
            readonly property int depth: root.depth(model.modelData, model.index)

            leftPadding: 20 * depth
            width: parent.width
            height: 23
            text: model.modelData
            color: model.modelData === ViewTarget.activeView ? Theme.accent
                : depth < 2 ? Theme.secondary : Theme.text
        }
    }
}
