// SPDX-License-Identifier: MIT
import QtQuick 2.15
import "."

/// A hard key under the mouse: down while it is pressed, with a bar that fills until it counts as held.
Rectangle {
    id: root

    property int keyId: 0
    property string label
    property string icon
    readonly property bool down: area.pressed
    property bool isHeld: false

    objectName: "key" + keyId
    width: Style.keyWidth
    height: Style.keyHeight
    radius: Style.radius
    color: down || lit.running ? Style.keyHeld : Style.key
    border.color: area.containsMouse ? Style.accent : Style.plateEdge

    Image {
        visible: root.icon !== ""
        anchors.horizontalCenter: parent.horizontalCenter
        y: root.label === "" ? (parent.height - height) / 2 : 6
        width: 24
        height: 24
        sourceSize { width: 48; height: 48 }
        source: root.icon === "" ? "" : "../icons/" + root.icon + ".svg"
    }

    Text {
        anchors.horizontalCenter: parent.horizontalCenter
        y: root.icon === "" ? (parent.height - height) / 2 : parent.height - height - 5
        width: parent.width - 6
        horizontalAlignment: Text.AlignHCenter
        text: root.label
        textFormat: Text.PlainText
        elide: Text.ElideRight
        color: Style.text
        font.pixelSize: root.icon === "" ? Style.fontSize : Style.smallFontSize
        font.bold: root.icon === ""
    }

    Rectangle {
        id: bar
        anchors.bottom: parent.bottom
        anchors.bottomMargin: 2
        x: 4
        height: 3
        radius: 1
        color: root.isHeld ? "#ffb454" : Style.accent
        visible: root.down

        NumberAnimation on width {
            id: fill
            running: root.down
            from: 0
            to: root.width - 8
            duration: 800
        }
    }

    MouseArea {
        id: area
        anchors.fill: parent
        hoverEnabled: true
        onPressed: {
            fill.duration = controls.longPressTime(root.keyId)
            root.isHeld = false
            controls.press(root.keyId)
        }
        onReleased: controls.release(root.keyId)
        onCanceled: controls.release(root.keyId)
    }

    Timer {
        id: lit
        interval: 160
    }

    Connections {
        target: controls
        function onKeySent(key, state) {
            if (key !== root.keyId)
                return
            lit.restart()
            root.isHeld = state === 3
        }
    }
}
