// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// A short mark such as "HD": filled while what it stands for is there, hollow while it is missing.
Rectangle {
    id: root

    property string text
    property bool lit: true
    property bool busy: false // is being looked for

    implicitWidth: label.implicitWidth + Theme.gap
    implicitHeight: label.implicitHeight + Theme.px(6)
    radius: Theme.px(8)
    color: lit ? Theme.accentSoft : "transparent"
    border.width: lit ? 0 : 1
    border.color: Theme.textMuted

    SequentialAnimation on opacity {
        running: root.busy && root.visible && AppSettings.animations
        loops: Animation.Infinite
        onStopped: root.opacity = 1

        NumberAnimation { to: 0.35; duration: Theme.durationAmbient; easing.type: Theme.easingAmbient }
        NumberAnimation { to: 1; duration: Theme.durationAmbient; easing.type: Theme.easingAmbient }
    }

    Label {
        id: label

        anchors.centerIn: parent
        content: root.text
        color: root.lit ? Theme.accent : Theme.textMuted
        font.pixelSize: Theme.textCaption
        font.weight: Font.Bold
    }
}
