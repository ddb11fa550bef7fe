// SPDX-License-Identifier: MIT
import QtQuick 2.15

Tappable {
    id: root

    property string icon
    property string text
    property bool primary: false
    property color color: primary ? Theme.accent : Theme.surfaceHigh
    property color textColor: primary ? Theme.accentText : Theme.text

    implicitWidth: Math.max(Theme.px(160), content.implicitWidth + 2 * Theme.margin)
    implicitHeight: Theme.touchTarget
    radius: height / 2
    fill: color
    pressedFill: Qt.darker(color, 1.2)
    label: text
    opacity: active ? 1 : 0.4

    Row {
        id: content

        anchors.centerIn: parent
        spacing: Theme.gap / 2
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            visible: root.icon.length > 0
            name: root.icon
            size: Theme.px(28)
            color: root.textColor
        }

        Label {
            anchors.verticalCenter: parent.verticalCenter
            visible: root.text.length > 0
            width: Math.min(implicitWidth, root.width - 2 * Theme.margin - (root.icon.length > 0 ? Theme.px(28) + Theme.gap / 2 : 0))
            content: root.text
            color: root.textColor
            font.weight: Font.DemiBold
        }
    }
}
