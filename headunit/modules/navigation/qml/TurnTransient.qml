// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The turn that is close, on screens other than the map.
Rectangle {
    width: Math.min(row.implicitWidth + 2 * Theme.margin, Theme.px(900))
    height: Theme.px(96)
    radius: height / 2
    color: Theme.accent

    Row {
        id: row

        anchors.centerIn: parent
        spacing: Theme.gap
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
        LayoutMirroring.enabled: false // mirrored by its layout direction

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            name: _navigation.turnIcon
            size: Theme.px(56)
            color: Theme.accentText
        }

        Label {
            objectName: "turnTransientDistance"
            anchors.verticalCenter: parent.verticalCenter
            content: _navigation.turnDistance
            color: Theme.accentText
            font.pixelSize: Theme.textTitle
            font.weight: Font.DemiBold
        }

        Label {
            anchors.verticalCenter: parent.verticalCenter
            width: Math.min(implicitWidth, Theme.px(520))
            content: _navigation.turnStreet.length > 0 ? _navigation.turnStreet : _navigation.turnText
            color: Theme.accentText
            font.pixelSize: Theme.textTitle
        }
    }
}
