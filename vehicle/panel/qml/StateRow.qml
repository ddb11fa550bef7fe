// SPDX-License-Identifier: MIT
import QtQuick 2.15
import "."

/// One field of a source: a switch, or a choice of numbers.
Item {
    id: root

    required property int index
    required property string text
    required property string name
    required property var choices
    required property int value

    objectName: name
    width: ListView.view ? ListView.view.width - 10 : 300
    height: choices.length > 0 ? options.y + options.height + 6 : 28

    Text {
        y: 5
        width: parent.width - 60
        text: root.text
        elide: Text.ElideRight
        color: Style.text
        font.pixelSize: Style.fontSize
    }

    Rectangle {
        visible: root.choices.length === 0
        anchors.right: parent.right
        y: 4
        width: 38
        height: 20
        radius: 10
        color: root.value !== 0 ? Style.accent : Style.key
        border.color: Style.plateEdge

        Rectangle {
            x: root.value !== 0 ? parent.width - width - 2 : 2
            y: 2
            width: 16
            height: 16
            radius: 8
            color: root.value !== 0 ? Style.accentText : Style.textMuted
        }

        MouseArea {
            anchors.fill: parent
            onClicked: controls.states.set(root.index, root.value !== 0 ? 0 : 1)
        }
    }

    Flow {
        id: options
        y: 26
        width: parent.width
        spacing: 3

        Repeater {
            model: root.choices

            Rectangle {
                required property var modelData
                width: Math.max(34, choice.implicitWidth + 10)
                height: 22
                radius: 5
                color: modelData.number === root.value ? Style.accent : Style.key

                Text {
                    id: choice
                    anchors.centerIn: parent
                    text: parent.modelData.text
                    color: parent.modelData.number === root.value ? Style.accentText : Style.text
                    font.pixelSize: Style.smallFontSize
                }

                MouseArea {
                    anchors.fill: parent
                    onClicked: controls.states.set(root.index, parent.modelData.number)
                }
            }
        }
    }
}
