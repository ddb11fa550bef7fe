// SPDX-License-Identifier: MIT
import QtQuick 2.15

Tappable {
    id: root

    property string icon
    property string text
    property bool primary: false
    property color color: primary ? Theme.accent : Theme.surfaceHigh
    property color textColor: primary ? Theme.accentText : Theme.text

    readonly property real iconSpace: icon.length > 0 ? Theme.px(28) + content.spacing : 0

    implicitWidth: Math.max(Theme.px(160), iconSpace + label.implicitWidth + 2 * Theme.margin)
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
        LayoutMirroring.enabled: false // mirrored by its layout direction

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            visible: root.icon.length > 0
            name: root.icon
            size: Theme.px(28)
            color: root.textColor
        }

        Label {
            id: label

            anchors.verticalCenter: parent.verticalCenter
            visible: root.text.length > 0
            width: Math.min(implicitWidth, root.width - 2 * Theme.margin - root.iconSpace)
            content: root.text
            color: root.textColor
            font.weight: Font.DemiBold
        }
    }
}
