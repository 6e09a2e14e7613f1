import QtQuick 2.15
import HeadUnit 1.0
import ".."
import "../controls"

/** The simulated car below the display, for those who develop for it. */
Rectangle {
    id: root

    readonly property var entries: [
        { name: "incomingCall", icon: "ring_volume", text: "Call", event: "IncomingCall", data: { caller: "Edda Quill" } },
        { name: "callBanner", icon: "phone_callback", text: "2nd call", popup: "phone/call", data: { caller: "Jonas Averill" } },
        { name: "trafficAlert", icon: "campaign", text: "Alert", event: "TrafficAlert" },
        { name: "announcementDone", icon: "voice_over_off", text: "Read out", event: "AnnouncementDone" },
        { name: "traffic", icon: "traffic", text: "Jam", popup: "navigation/traffic", data: { minutes: 12, road: "Ring Road" } },
        { name: "advert", icon: "local_offer", text: "Advert", popup: "navigation/advert" },
        { name: "parking", icon: "local_parking", text: "Parking", popup: "car/parking", data: { centimetres: 60 } },
        { name: "fuel", icon: "local_gas_station", text: "Fuel", ink: Theme.warning, popup: "car/fuel", data: { percent: 8 } },
        { name: "update", icon: "system_update", text: "Update", popup: "system/update", data: { version: "4.2" } },
        { name: "updateDone", icon: "task_alt", text: "Updated", event: "UpdateDone" },
        { name: "volume", icon: "volume_up", text: "Volume", popup: "media/volume", data: { level: 11 } },
        { name: "voice", icon: "mic", text: "Voice", popup: "system/voice" },
        { name: "mediaLost", icon: "usb", text: "USB lost", popup: "media/lost", data: { source: "usb" } },
        { name: "wheel", icon: "radio_button_checked", text: "OK wheel", event: "Confirm", data: "wheel" },
        { name: "repaired", icon: "build", text: "Repaired", ink: Theme.positive, event: "FaultRepaired" },
        { name: "fault", icon: "report_problem", text: "Fault", ink: Theme.critical, popup: "car/fault", data: { code: 17 } }
    ]

    color: Theme.background

    Rectangle {
        width: parent.width
        height: 1
        color: Theme.line
    }

    VehicleSlider {
        id: speed

        objectName: "slider-speed"
        x: 24
        y: 14
        width: 320
        icon: "speed"
        unit: "km/h"
        maximum: 220
        value: Vehicle.speed
        onMoved: Vehicle.speed = value
    }

    VehicleSlider {
        objectName: "slider-fuel"
        x: 24
        y: 94
        width: 320
        icon: "local_gas_station"
        unit: "%"
        value: Vehicle.fuel
        onMoved: Vehicle.fuel = value
    }

    GearSelector {
        id: gears

        anchors.left: speed.right
        anchors.leftMargin: 24
        y: 14
        width: 200
    }

    Row {
        anchors.left: gears.left
        y: 94
        height: 72
        spacing: 8

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            name: "smartphone"
            size: 28
            color: Theme.secondary
        }

        Switch {
            objectName: "switch-phone"
            checked: Vehicle.phoneConnected
            onToggled: Vehicle.phoneConnected = checked
        }

        RestrictionSign {
            objectName: "restriction"
            anchors.verticalCenter: parent.verticalCenter
            active: Vehicle.moving
            onClicked: Vehicle.speed = Vehicle.moving ? 0 : 50
        }
    }

    Grid {
        id: grid

        readonly property real cell: (width - 7 * spacing) / 8

        anchors.left: gears.right
        anchors.leftMargin: 24
        anchors.right: parent.right
        anchors.rightMargin: 16
        y: 13
        columns: 8
        spacing: 6

        Repeater {
            model: root.entries

            ProvokeButton {
                width: grid.cell
                entry: model.modelData
            }
        }
    }
}
