import QtQuick 2.15
import HeadUnit 1.0
import ".."

/** What was asked for last, and what became of it. */
PanelSection {
    id: root

    title: "Requests"
    note: "newest first"

    Repeater {
        model: Inspector.requests

        RequestRow {
            width: parent.width
            time: model.time
            request: model.request
            outcome: model.outcome
            accepted: model.accepted
        }
    }
}
