// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// Shows that its parent is what a press of the knob is for.
Rectangle {
    id: root

    property bool shown: false
    property real around: Theme.radius // radius of the parent

    anchors.fill: parent
    visible: shown
    radius: around
    color: "transparent"
    border.width: Theme.px(4)
    border.color: Theme.focus
    z: 10
}
