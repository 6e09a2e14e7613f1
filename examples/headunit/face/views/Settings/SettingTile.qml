import QtQuick 2.15
import "../.."
import "../../controls"

/** A tile of the settings: three side by side, two rows. */
Tile {
    id: root

    width: (1120 - 2 * Theme.gap) / 3
    height: (464 - Theme.gap) / 2
}
