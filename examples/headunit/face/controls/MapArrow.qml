import QtQuick 2.15

/** The car's place on a map, pointing to where it goes. */
Canvas {
    id: root

    property color colour

    width: 108
    height: 108
    onColourChanged: root.requestPaint()
    onPaint: {
        const ctx = root.getContext("2d")
        ctx.reset()
        ctx.translate(root.width / 2, root.height / 2)
        const glow = ctx.createRadialGradient(0, 0, 8, 0, 0, 54)
        glow.addColorStop(0, Qt.rgba(root.colour.r, root.colour.g, root.colour.b, 0.55))
        glow.addColorStop(1, Qt.rgba(root.colour.r, root.colour.g, root.colour.b, 0))
        ctx.fillStyle = glow
        ctx.beginPath(); ctx.arc(0, 0, 54, 0, 2 * Math.PI); ctx.fill()
        ctx.fillStyle = "#f2f5f8"
        ctx.beginPath(); ctx.arc(0, 0, 29, 0, 2 * Math.PI); ctx.fill()
        ctx.fillStyle = Qt.darker(root.colour, 1.25)
        ctx.beginPath()
        ctx.moveTo(0, -20); ctx.lineTo(15, 15); ctx.lineTo(0, 8); ctx.closePath()
        ctx.fill()
        ctx.fillStyle = root.colour
        ctx.beginPath()
        ctx.moveTo(0, -20); ctx.lineTo(0, 8); ctx.lineTo(-15, 15); ctx.closePath()
        ctx.fill()
    }
}
