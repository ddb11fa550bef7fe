// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// Says why there is nothing to show.
Column {
    id: root

    property string icon
    property string text
    property string detail

    spacing: Theme.gap

    Icon {
        anchors.horizontalCenter: parent.horizontalCenter
        visible: root.icon.length > 0
        name: root.icon
        size: Theme.px(88)
        color: Theme.textMuted
    }

    Label {
        width: parent.width
        horizontalAlignment: Text.AlignHCenter
        wrapMode: Text.Wrap
        maximumLineCount: 2
        content: root.text
        font.pixelSize: Theme.textTitle
        font.weight: Font.DemiBold
    }

    Label {
        width: parent.width
        visible: root.detail.length > 0
        horizontalAlignment: Text.AlignHCenter
        wrapMode: Text.Wrap
        maximumLineCount: 3
        content: root.detail
        color: Theme.textMuted
    }
}
