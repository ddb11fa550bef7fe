// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// One app: its icon above its name.
Tappable {
    id: root

    property url iconUrl
    property string name

    label: name
    fill: Theme.surfaceHigh
    opacity: active ? 1 : 0.4

    Icon {
        anchors { horizontalCenter: parent.horizontalCenter; verticalCenter: parent.verticalCenter; verticalCenterOffset: -Theme.px(18) }
        base: root.iconUrl
        size: Theme.px(60)
        color: Theme.accent
    }

    Label {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.gap / 2; bottomMargin: Theme.gap }
        horizontalAlignment: Text.AlignHCenter
        content: root.name
    }
}
