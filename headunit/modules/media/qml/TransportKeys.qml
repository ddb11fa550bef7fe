// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Previous, play or pause, next: in one order everywhere, as on the front panel.
Row {
    id: root

    spacing: Theme.margin
    LayoutMirroring.enabled: false

    IconButton {
        objectName: "previousTrack"
        anchors.verticalCenter: parent.verticalCenter
        width: Theme.px(88)
        height: width
        icon: "skip-previous"
        label: qsTr("Previous")
        fill: Theme.surface
        active: _media.available
        onClicked: _media.previous()
    }

    IconButton {
        objectName: "playPause"
        width: Theme.px(112)
        height: width
        iconSize: Theme.px(52)
        icon: _media.heard && _media.playing ? "pause" : "play"
        label: _media.heard && _media.playing ? qsTr("Pause") : qsTr("Play")
        fill: Theme.accent
        pressedFill: Qt.darker(Theme.accent, 1.2)
        iconColor: Theme.accentText
        active: _media.available
        onClicked: _media.togglePlayPause()
    }

    IconButton {
        objectName: "nextTrack"
        anchors.verticalCenter: parent.verticalCenter
        width: Theme.px(88)
        height: width
        icon: "skip-next"
        label: qsTr("Next")
        fill: Theme.surface
        active: _media.available
        onClicked: _media.next()
    }
}
