// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// A key of the climate control that is on or off: an icon and what it means beneath.
Tappable {
    id: root

    property string icon
    property string text
    property bool on: false
    property color ground: Theme.surfaceHigh

    label: text
    fill: on ? Theme.accent : ground
    pressedFill: on ? Qt.darker(Theme.accent, 1.2) : Theme.surfacePressed

    Icon {
        anchors { horizontalCenter: parent.horizontalCenter; verticalCenter: parent.verticalCenter; verticalCenterOffset: -Theme.px(14) }
        name: root.icon
        size: Theme.px(40)
        color: root.on ? Theme.accentText : Theme.text
    }

    Label {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; leftMargin: Theme.px(4); rightMargin: Theme.px(4); bottomMargin: Theme.px(12) }
        horizontalAlignment: Text.AlignHCenter
        content: root.text
        color: root.on ? Theme.accentText : Theme.text
        font.pixelSize: Theme.textCaption
    }
}
