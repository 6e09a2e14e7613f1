import HmiStateMachine 1.0

Panel {
    title: "Home"
    Button { text: "Stations"; onClicked: Requests.view("Stations") }
    Button { text: "News"; onClicked: Requests.view("Radio", { name: "City News", mhz: 98.4 }) }
}
