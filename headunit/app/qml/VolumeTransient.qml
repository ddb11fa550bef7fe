// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The volume, for as long as it changes.
Rectangle {
    width: Theme.px(520)
    height: Theme.px(84)
    radius: height / 2
    color: Theme.surfaceHigh
    border.width: 1
    border.color: Theme.outline

    Row {
        anchors.centerIn: parent
        spacing: Theme.gap
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            name: _globalSource.muted ? "mute" : "volume"
            mirrorsWithLayout: true
        }

        Slider {
            anchors.verticalCenter: parent.verticalCenter
            width: Theme.px(320)
            to: 40
            value: _globalSource.volume
            label: qsTr("Volume")
            onMoved: function (value) { _globalSource.setVolume(value); }
        }

        Label {
            anchors.verticalCenter: parent.verticalCenter
            width: Theme.px(44)
            content: _globalSource.volume
            font.weight: Font.DemiBold
        }
    }
}
