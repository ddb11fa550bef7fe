// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// A list that scrolls, with a bar that shows where one is.
ListView {
    id: root

    clip: true
    spacing: Theme.px(4)
    boundsBehavior: Flickable.StopAtBounds

    Rectangle {
        anchors.right: Theme.mirrored ? undefined : parent.right
        anchors.left: Theme.mirrored ? parent.left : undefined
        y: root.visibleArea.yPosition * root.height
        width: Theme.px(5)
        height: root.visibleArea.heightRatio * root.height
        radius: width / 2
        visible: root.visibleArea.heightRatio < 1
        color: Theme.outline
    }
}
