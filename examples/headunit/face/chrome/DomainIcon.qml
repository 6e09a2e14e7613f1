import QtQuick 2.15
import "../controls"

/** The sign of a domain. */
Icon {
    id: root

    property string domain

    readonly property var names: ({
        Home: "home",
        Media: "music_note",
        Phone: "phone",
        Navigation: "navigation",
        Settings: "settings"
    })

    name: root.names[root.domain] || "apps"
}
