// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// What is heard now, with the keys that every source has.
Card {
    id: root

    Column {
        anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.margin }
        spacing: Theme.gap / 2

        Label {
            width: parent.width
            content: _nowPlaying.source
            color: Theme.accent
            font.weight: Font.DemiBold
        }

        Label {
            objectName: "nowPlayingTitle"
            width: parent.width
            content: _nowPlaying.title
            font.pixelSize: Theme.px(44)
            font.weight: Font.DemiBold
            wrapMode: Text.Wrap
            maximumLineCount: 2
        }

        Label {
            width: parent.width
            content: _nowPlaying.subtitle
            color: Theme.textMuted
            wrapMode: Text.Wrap
            maximumLineCount: 2
        }
    }

    Rectangle {
        anchors.centerIn: parent
        anchors.verticalCenterOffset: Theme.px(24)
        width: Theme.px(196)
        height: width
        radius: width / 2
        color: Theme.accentSoft

        Icon {
            anchors.centerIn: parent
            name: _nowPlaying.icon
            size: Theme.px(96)
            color: Theme.accent
        }
    }

    Row {
        anchors { horizontalCenter: parent.horizontalCenter; bottom: parent.bottom; bottomMargin: Theme.margin }
        spacing: Theme.margin
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight

        IconButton {
            width: Theme.px(88)
            height: width
            icon: "seek-down"
            label: qsTr("Previous")
            mirrorsWithLayout: true
            fill: Theme.surfaceHigh
            onClicked: _nowPlaying.previous()
        }

        IconButton {
            width: Theme.px(88)
            height: width
            icon: _globalSource.muted ? "volume" : "mute"
            label: _globalSource.muted ? qsTr("Sound on") : qsTr("Mute")
            fill: Theme.surfaceHigh
            onClicked: _globalSource.setMuted(!_globalSource.muted)
        }

        IconButton {
            width: Theme.px(88)
            height: width
            icon: "seek-up"
            label: qsTr("Next")
            mirrorsWithLayout: true
            fill: Theme.surfaceHigh
            onClicked: _nowPlaying.next()
        }
    }
}
