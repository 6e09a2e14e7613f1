import QtQuick 2.15

/** The car park behind the car at dusk: a wall, the town behind it, and the lines of the spaces. */
CameraLens {
    id: root

    readonly property real wall: 6.4 ///< metres behind the car
    readonly property real edge: root.at(0, 1.5, root.wall).y

    function drawTown(context) {
        var sky = context.createLinearGradient(0, 0, 0, root.edge)
        sky.addColorStop(0, "#24344f")
        sky.addColorStop(0.6, "#5d6684")
        sky.addColorStop(1, "#c79a82")
        context.fillStyle = sky
        context.fillRect(0, 0, root.width, root.edge + 4)

        var heights = [46, 68, 38, 84, 56, 30, 76, 50, 92, 44, 62, 36, 72]
        for (var i = 0; i < heights.length; ++i) {
            context.fillStyle = i % 2 ? "#2c3446" : "#363f52"
            context.fillRect(i * 95 - 20, root.edge - heights[i], 97, heights[i] + 4)
            context.fillStyle = "#e3bd86"
            for (var j = 0; j < 6; ++j)
                if ((i * 7 + j * 5) % 4 === 0)
                    context.fillRect(i * 95 + (j % 3) * 24 - 8, root.edge - heights[i] + 12 + (j > 2 ? 22 : 0), 8, 11)
        }
        context.fillStyle = "#1e2a2b"
        for (var k = 0; k < 12; ++k) {
            context.beginPath()
            context.arc(20 + k * 107, root.edge + 4, 26 + (k * 13) % 17, 0, 2 * Math.PI)
            context.fill()
        }
    }

    function drawGround(context) {
        var asphalt = context.createLinearGradient(0, root.horizon, 0, root.height)
        asphalt.addColorStop(0, "#50545e")
        asphalt.addColorStop(0.35, "#3c4048")
        asphalt.addColorStop(1, "#282b31")
        context.fillStyle = asphalt
        context.fillRect(0, root.edge, root.width, root.height - root.edge)
    }

    function drawWall(context) {
        var far = root.wall
        root.fill(context, [[-9, 0, far], [9, 0, far], [9, 1.5, far], [-9, 1.5, far]], "#6a6e78")
        root.fill(context, [[-9, 1.5, far], [9, 1.5, far], [9, 1.62, far], [-9, 1.62, far]], "#8b8f99")
        for (var i = -8; i < 9; ++i)
            root.fill(context, [[i, 0, far], [i + 0.03, 0, far], [i + 0.03, 1.5, far], [i, 1.5, far]], "#5d616b")
        root.fill(context, [[-9, 0, far], [9, 0, far], [9, 0.3, far], [-9, 0.3, far]], "#40000000")
        root.strip(context, -9, 9, far - 0.7, far, "#50000000")
        // A sign above the free space.
        root.fill(context, [[-0.36, 0.75, far], [0.36, 0.75, far], [0.36, 1.4, far], [-0.36, 1.4, far]], "#2f62b5")
        var sign = root.at(0, 0.86, far)
        context.fillStyle = "#f2f5f8"
        context.font = "bold 30px Inter"
        context.textAlign = "center"
        context.fillText("P", sign.x, sign.y)
    }

    function drawSpaces(context) {
        for (var i = -4; i <= 4; i += 1) {
            var x = i * 2.6 + 1.3
            root.strip(context, x - 0.06, x + 0.06, 0.9, root.wall - 0.9, "#dfe1e5")
        }
        // The blocks that stop the wheels.
        for (var j = -2; j <= 2; ++j) {
            var z = root.wall - 0.9
            root.fill(context, [[j * 2.6 - 0.8, 0, z], [j * 2.6 + 0.8, 0, z], [j * 2.6 + 0.8, 0.13, z], [j * 2.6 - 0.8, 0.13, z]], "#c9a13b")
        }
    }

    onPaint: {
        var context = root.getContext("2d")
        context.reset()
        root.drawTown(context)
        root.drawGround(context)
        root.drawWall(context)
        root.drawSpaces(context)
    }
}
