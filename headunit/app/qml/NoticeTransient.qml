// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Says why something could not be done.
Rectangle {
    width: Math.min(row.implicitWidth + 2 * Theme.margin, Theme.px(900))
    height: Theme.px(84)
    radius: height / 2
    color: Theme.surfaceHigh
    border.width: 1
    border.color: Theme.outline

    Row {
        id: row

        anchors.centerIn: parent
        spacing: Theme.gap
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
        LayoutMirroring.enabled: false // mirrored by its layout direction

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            name: "info"
            color: Theme.accent
        }

        Label {
            objectName: "noticeText"
            anchors.verticalCenter: parent.verticalCenter
            width: Math.min(implicitWidth, Theme.px(780))
            content: _systemScreens.notice
        }
    }
}
