import QtQuick 2.15
import HmiStateMachine 1.0
import HeadUnit 1.0
import ".."
import "../controls"

/** The tank is nearly empty. */
WarningPopup {
    id: root

    readonly property int percent: Number(root.read("percent", Vehicle.fuel))
    /** A warning that was kept comes without its data, when the tank may be full again. */
    readonly property bool known: root.percent < 20

    stateName: "car/fuel"
    icon: "local_gas_station"
    title: "Fuel is low"
    text: !root.known ? "Please refuel soon" : root.percent + " % left, enough for about " + Math.round(root.percent * 0.7) * 10 + " km"
    yes: "Show on map"
    no: "Later"
    onAccepted: Requests.view("Navigation/Map")

    ProgressBar {
        width: parent.width
        height: root.known ? 12 : 0
        visible: root.known
        value: root.percent / 100
        barColor: Theme.warning
    }
}
