// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// What the person may mean, the most likely first; scrolls.
ListView {
    id: root

    objectName: "candidates"
    height: Theme.touchTarget
    orientation: ListView.Horizontal
    layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
    LayoutMirroring.enabled: false // mirrored by its layout direction
    spacing: Theme.gap / 4
    clip: true
    boundsBehavior: Flickable.StopAtBounds
    model: _inputPanel.candidates
    onModelChanged: positionViewAtBeginning()

    delegate: Tappable {
        objectName: "candidate" + index
        width: Math.max(Theme.px(84), text.implicitWidth + 2 * Theme.gap)
        height: root.height
        radius: Theme.radius / 2
        fill: index === 0 ? Theme.accentSoft : "transparent"
        label: modelData
        onClicked: _inputPanel.select(index)

        Label {
            id: text

            anchors.centerIn: parent
            width: Math.min(implicitWidth, Theme.px(600))
            content: modelData
            color: index === 0 ? Theme.accent : Theme.text
            font.pixelSize: Theme.textTitle
        }
    }

    Rectangle {
        anchors { bottom: parent.bottom }
        x: root.visibleArea.xPosition * root.width
        width: root.visibleArea.widthRatio * root.width
        height: Theme.px(3)
        visible: root.visibleArea.widthRatio < 1
        color: Theme.outline
    }
}
