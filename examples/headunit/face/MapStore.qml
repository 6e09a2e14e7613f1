pragma Singleton
import QtQuick 2.15

/** The grounds of maps that were painted last: to paint the city takes longer than to show a screen. */
Item {
    id: root

    readonly property int most: 4
    property var sheets: [] ///< each with a key and the image that keeps its picture, the one used last first
    readonly property Component image: Image { }

    /** The source of a picture; empty when it has to be painted. */
    function picture(key) {
        const sheet = root.sheets.find(sheet => sheet.key === key)
        if (!sheet)
            return ""
        root.sheets = [sheet].concat(root.sheets.filter(other => other !== sheet))
        return String(sheet.image.source)
    }

    /** Keeps what the item looks like. */
    function keep(key, item) {
        item.grabToImage(grab => {
            if (!root.sheets.some(sheet => sheet.key === key))
                root.add({ key: key, image: root.image.createObject(root, { source: grab.url }) })
        })
    }

    function add(sheet) {
        const all = [sheet].concat(root.sheets)
        all.slice(root.most).forEach(old => old.image.destroy())
        root.sheets = all.slice(0, root.most)
    }
}
