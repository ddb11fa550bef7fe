// SPDX-License-Identifier: MIT
import QtQuick 2.15
import "."

/// The steering wheel with a group of keys on each spoke.
Item {
    id: root

    implicitWidth: 440
    implicitHeight: 440

    Canvas {
        anchors.fill: parent
        antialiasing: true
        onPaint: {
            const context = getContext("2d")
            const middle = width / 2
            const rim = (radius, line, colour) => {
                context.beginPath()
                context.arc(middle, middle, radius, 0, 2 * Math.PI)
                context.lineWidth = line
                context.strokeStyle = colour
                context.stroke()
            }
            context.fillStyle = "#20272f"
            context.beginPath() // the spokes and the airbag's cover
            context.moveTo(22, middle - 46)
            context.bezierCurveTo(middle - 90, middle - 74, middle + 90, middle - 74, width - 22, middle - 46)
            context.lineTo(width - 22, middle + 52)
            context.bezierCurveTo(middle + 110, middle + 62, middle + 56, middle + 90, middle + 38, height - 26)
            context.lineTo(middle - 38, height - 26)
            context.bezierCurveTo(middle - 56, middle + 90, middle - 110, middle + 62, 22, middle + 52)
            context.closePath()
            context.fill()
            context.beginPath()
            context.arc(middle, middle + 6, 62, 0, 2 * Math.PI)
            context.fillStyle = "#181e25"
            context.fill()
            context.lineWidth = 2
            context.strokeStyle = "#3b4754"
            context.stroke()
            rim(middle - 24, 40, "#0b0e12")
            rim(middle - 24, 34, "#262f39")
            rim(middle - 17, 3, "#3b4754")
        }
    }

    Column {
        x: 56
        y: root.height / 2 - 40
        spacing: 6

        Row {
            spacing: 6
            WheelKey { keyId: 88; icon: "seek-down" }
            WheelKey { keyId: 89; icon: "seek-up" }
        }

        Row {
            spacing: 6
            WheelKey { keyId: 90; icon: "left" }
            WheelKey { keyId: 91; icon: "right" }
        }
    }

    Column {
        x: root.width - 56 - width
        y: root.height / 2 - 40
        spacing: 6

        Row {
            spacing: 6
            WheelKey { keyId: 79; icon: "pick-up" }
            WheelKey { keyId: 80; icon: "end" }
        }

        WheelKey { keyId: 10; icon: "talk"; width: 106 }
    }
}
