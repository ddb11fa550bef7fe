// SPDX-License-Identifier: MIT
import QtQuick 2.15
import "."

Rectangle {
    id: root

    property string text
    property bool checked: false
    signal clicked

    width: label.implicitWidth + 20
    height: 28
    radius: 6
    color: checked ? Style.accent : area.pressed ? Style.keyHeld : Style.key
    border.color: Style.plateEdge

    Text {
        id: label
        anchors.centerIn: parent
        text: root.text
        color: root.checked ? Style.accentText : Style.text
        font.pixelSize: Style.fontSize
    }

    MouseArea {
        id: area
        anchors.fill: parent
        onClicked: root.clicked()
    }
}
