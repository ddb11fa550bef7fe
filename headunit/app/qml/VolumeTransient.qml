// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The volume, for as long as it changes: that of the voice while one is heard, otherwise that of the music.
Rectangle {
    id: root

    readonly property bool voice: _speechSource.sessionState !== 0 || _speechSource.ttsSessionActive
    readonly property int volume: voice ? _globalSource.voiceVolume : _globalSource.volume

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
        LayoutMirroring.enabled: false // mirrored by its layout direction

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            objectName: "volumeIcon"
            name: root.voice ? "voice" : _globalSource.muted ? "mute" : "volume"
            mirrorsWithLayout: true
        }

        Slider {
            anchors.verticalCenter: parent.verticalCenter
            width: Theme.px(320)
            visible: !root.voice
            to: 40
            value: root.volume
            label: qsTr("Volume")
            onMoved: function (value) { _globalSource.setVolume(value); }
        }

        ProgressBar {
            anchors.verticalCenter: parent.verticalCenter
            width: Theme.px(320)
            visible: root.voice // only the keys change it
            to: 40
            value: root.volume
            label: qsTr("Volume of the voice")
        }

        Label {
            anchors.verticalCenter: parent.verticalCenter
            width: Theme.px(44)
            objectName: "volumeText"
            content: root.volume
            font.weight: Font.DemiBold
        }
    }
}
