// SPDX-License-Identifier: MIT
import QtQuick 2.15
import "."

/// A dial: the mouse wheel turns it, its two halves are keys to hold, and the middle may be a key of its own.
Item {
    id: root

    property int downKey: 0
    property int upKey: 0
    property int middleKey: 0
    property string middleIcon
    property string label
    property real angle: 0

    width: 150
    height: 178

    function turn(steps: int) {
        if (steps === 0)
            return
        controls.turn(steps > 0 ? upKey : downKey, Math.abs(steps))
    }

    Canvas {
        id: ring
        width: 150
        height: 150
        rotation: root.angle
        antialiasing: true
        Behavior on rotation { NumberAnimation { duration: 90 } }
        onPaint: {
            const context = getContext("2d")
            const middle = width / 2
            const shade = context.createRadialGradient(middle - 20, middle - 25, 8, middle, middle, middle)
            shade.addColorStop(0, "#56636f")
            shade.addColorStop(1, "#1d242c")
            context.beginPath()
            context.arc(middle, middle, middle - 2, 0, 2 * Math.PI)
            context.fillStyle = shade
            context.fill()
            context.strokeStyle = "#0b0f13"
            context.lineWidth = 2
            for (let notch = 0; notch < 40; ++notch) {
                const at = notch * Math.PI / 20
                context.beginPath()
                context.moveTo(middle + Math.cos(at) * (middle - 3), middle + Math.sin(at) * (middle - 3))
                context.lineTo(middle + Math.cos(at) * (middle - 11), middle + Math.sin(at) * (middle - 11))
                context.stroke()
            }
            context.beginPath()
            context.arc(middle, 22, 4, 0, 2 * Math.PI)
            context.fillStyle = "#4fd1c5"
            context.fill()
        }
    }

    Repeater {
        model: [{ keyId: root.downKey, sign: "\u2212", left: true }, { keyId: root.upKey, sign: "+", left: false }]

        Item {
            required property var modelData
            objectName: "key" + modelData.keyId
            x: modelData.left ? 0 : 75
            width: 75
            height: 150

            Text {
                x: parent.modelData.left ? 16 : parent.width - width - 16
                anchors.verticalCenter: parent.verticalCenter
                text: parent.modelData.sign
                color: half.pressed ? Style.accent : Style.text
                font.pixelSize: 22
            }

            MouseArea {
                id: half
                anchors.fill: parent
                onPressed: controls.press(parent.modelData.keyId)
                onReleased: controls.release(parent.modelData.keyId)
                onCanceled: controls.release(parent.modelData.keyId)
                onWheel: (wheel) => root.turn(Math.round(wheel.angleDelta.y / 120))
            }
        }
    }

    PanelKey {
        visible: root.middleKey !== 0
        keyId: root.middleKey
        icon: root.middleIcon
        anchors.centerIn: ring
        width: 58
        height: 58
        radius: 29
    }

    Text {
        anchors.horizontalCenter: ring.horizontalCenter
        anchors.bottom: parent.bottom
        text: root.label
        color: Style.textMuted
        font.pixelSize: Style.smallFontSize
    }

    Connections {
        target: controls
        function onKeySent(key, state) {
            if (state === 2 && key === root.upKey)
                root.angle += 9
            else if (state === 2 && key === root.downKey)
                root.angle -= 9
        }
    }
}
