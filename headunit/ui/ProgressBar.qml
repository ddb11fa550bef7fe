// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// How far something has come; while that is not known (\a busy) a part of the line wanders.
Rectangle {
    id: root

    property real value: 0
    property real to: 1
    property bool busy: false
    property string label
    property bool mirrored: Theme.mirrored
    readonly property real ratio: to > 0 ? Math.max(0, Math.min(1, value / to)) : 0
    property real phase // 0 to 1, where the wandering part is

    implicitHeight: Theme.px(8)
    implicitWidth: Theme.px(320)
    radius: height / 2
    color: Theme.outline

    Accessible.role: Accessible.ProgressBar
    Accessible.name: label

    Rectangle {
        readonly property real place: root.busy ? (root.width - width) * root.phase : 0

        x: root.mirrored ? root.width - width - place : place
        width: root.width * (root.busy ? 0.3 : root.ratio)
        height: parent.height
        radius: parent.radius
        color: Theme.accent
    }

    SequentialAnimation on phase {
        running: root.busy && root.visible && AppSettings.animations
        loops: Animation.Infinite

        NumberAnimation { to: 1; duration: Theme.durationAmbient; easing.type: Theme.easingAmbient }
        NumberAnimation { to: 0; duration: Theme.durationAmbient; easing.type: Theme.easingAmbient }
    }
}
