// SPDX-License-Identifier: MIT
import QtQuick 2.15

Tappable {
    id: root

    property string icon
    property color iconColor: Theme.text
    property real iconSize: Theme.iconSize
    property bool mirrorsWithLayout: false

    implicitWidth: Theme.touchTarget
    implicitHeight: Theme.touchTarget
    radius: Math.min(width, height) / 2

    Icon {
        anchors.centerIn: parent
        name: root.icon
        size: root.iconSize
        color: root.iconColor
        opacity: root.active ? 1 : 0.35
        mirrorsWithLayout: root.mirrorsWithLayout
    }
}
