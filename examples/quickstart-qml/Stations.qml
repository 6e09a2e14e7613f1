import HmiStateMachine 1.0

Panel {
    title: "Stations"
    Button { text: "Bay Jazz"; onClicked: Requests.view("Radio", { name: text, mhz: 94.7 }) }
    Button { text: "City News"; onClicked: Requests.view("Radio", { name: text, mhz: 98.4 }) }
    Button { text: "Harbour"; onClicked: Requests.view("Radio", { name: text, mhz: 101.2 }) }
}
