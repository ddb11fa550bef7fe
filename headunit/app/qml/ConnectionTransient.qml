// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Tells that the vehicle has gone or has come back.
Rectangle {
    width: row.width + 2 * Theme.margin
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
            name: _bridgeConnection.connected ? "check" : "disconnected"
            color: _bridgeConnection.connected ? Theme.positive : Theme.negative
        }

        Label {
            anchors.verticalCenter: parent.verticalCenter
            content: _bridgeConnection.connected ? qsTr("Vehicle connected") : qsTr("No connection to the vehicle")
        }
    }
}
