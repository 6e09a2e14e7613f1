import HmiStateMachine 1.0

Panel {
    id: screen
    property var viewData
    title: viewData.eventData.name + ", " + viewData.eventData.mhz + " MHz"
    Button { text: "Turn off"; onClicked: Requests.popup("TurnOff", screen.viewData.eventData) }
}
