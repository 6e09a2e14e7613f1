import QtQuick 2.15
import HmiStateMachine 1.0
import ".."

/** The popups that are shown, and those that wait behind them. */
PanelSection {
    id: root

    title: "Popups"
    note: ViewTarget.shownPopups.count + " shown, " + ViewTarget.stackedPopups.count + " waiting"

    Repeater {
        model: ViewTarget.shownPopups

        PopupRow {
            width: parent.width
            name: model.popupId
            layerName: model.layer
            kind: model.kind
            remainingTime: model.remainingTime
            covered: model.covered
        }
    }

    Repeater {
        model: ViewTarget.stackedPopups

        PopupRow {
            width: parent.width
            name: model.popupId
            layerName: model.layer
            kind: model.kind
            waiting: true
        }
    }
}
