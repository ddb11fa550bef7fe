// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// A list that scrolls, with a bar that shows where one is. While the driver has to look at the road, it ends after a few rows.
ListView {
    id: root

    readonly property real reachable: _drivingLock.locked ? originY + 10 * Theme.rowHeight : originY + contentHeight

    clip: true
    onContentYChanged: stayInReach()
    onReachableChanged: stayInReach()
    spacing: Theme.px(4)
    boundsBehavior: Flickable.StopAtBounds

    function stayInReach() {
        const last = Math.max(originY, reachable - height);
        if (_drivingLock.locked && contentY > last)
            contentY = last;
    }

    Rectangle {
        objectName: "endsEarly"
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom }
        height: Theme.touchTarget
        visible: _drivingLock.locked && root.contentY + root.height >= root.reachable - 1 && root.originY + root.contentHeight > root.reachable
        color: Theme.surfaceHigh

        Label {
            anchors.centerIn: parent
            width: Math.min(implicitWidth, parent.width)
            content: qsTr("More when you have stopped")
            color: Theme.textMuted
        }
    }

    Rectangle {
        objectName: "scrollBar"
        anchors.right: parent.right // mirrored with the layout
        y: root.visibleArea.yPosition * root.height
        width: Theme.px(5)
        height: root.visibleArea.heightRatio * root.height
        radius: width / 2
        visible: root.visibleArea.heightRatio < 1
        color: Theme.outline
    }
}
