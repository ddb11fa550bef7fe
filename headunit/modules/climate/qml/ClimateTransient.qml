// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// What a key or an intent has changed about the climate.
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
            name: _climateNotice.icon
            color: Theme.accent
        }

        Label {
            objectName: "climateNoticeText"
            anchors.verticalCenter: parent.verticalCenter
            content: _climateNotice.text
        }

        Label {
            objectName: "climateNoticeValue"
            anchors.verticalCenter: parent.verticalCenter
            content: _climateNotice.value
            font.weight: Font.DemiBold
        }
    }
}
