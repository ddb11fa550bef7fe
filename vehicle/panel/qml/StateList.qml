// SPDX-License-Identifier: MIT
import QtQuick 2.15
import "."

/// Everything about the vehicle that decides what keys do.
ListView {
    id: root

    clip: true
    model: controls.states
    boundsBehavior: Flickable.StopAtBounds
    delegate: StateRow {}
    section.property: "section"
    section.delegate: Text {
        required property string section
        topPadding: 10
        bottomPadding: 4
        text: section
        color: Style.accent
        font.pixelSize: Style.fontSize
        font.bold: true
    }

    Rectangle {
        parent: root
        anchors.right: parent.right
        y: root.visibleArea.yPosition * root.height
        width: 3
        height: root.visibleArea.heightRatio * root.height
        radius: 1
        color: Style.plateEdge
        visible: root.visibleArea.heightRatio < 1
    }
}
