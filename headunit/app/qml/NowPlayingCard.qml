// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiIntents 1.0
import HmiUi 1.0

/// What is heard now, with the keys that every source has.
Card {
    id: root

    readonly property HmiIntentMonitor suspend: HmiIntents.intentMonitor(HmiIntents.SuspendMediaPlayback)
    readonly property HmiIntentMonitor resume: HmiIntents.intentMonitor(HmiIntents.ResumeMediaPlayback)

    Column {
        anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.margin }
        spacing: Theme.gap / 2

        Item {
            width: parent.width
            height: Theme.touchTarget

            Label {
                anchors { left: parent.left; right: sources.left; verticalCenter: parent.verticalCenter }
                objectName: "nowPlayingSource"
                content: _nowPlaying.source
                color: Theme.accent
                font.weight: Font.DemiBold
            }

            IconButton {
                id: sources

                objectName: "launcherSources"
                anchors { right: parent.right; verticalCenter: parent.verticalCenter }
                icon: "source"
                label: qsTr("Sources")
                fill: Theme.surfaceHigh
                onClicked: _viewManager.requestPopup("SYSTEM.AudioSources")
            }
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
        anchors.verticalCenterOffset: Theme.px(44)
        width: Theme.px(180)
        height: width
        radius: width / 2
        color: Theme.accentSoft

        Icon {
            anchors.centerIn: parent
            name: _nowPlaying.icon
            size: Theme.px(88)
            color: Theme.accent
        }
    }

    Row {
        anchors { horizontalCenter: parent.horizontalCenter; bottom: parent.bottom; bottomMargin: Theme.margin }
        spacing: Theme.margin
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
        LayoutMirroring.enabled: false // mirrored by its layout direction

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
            objectName: "nowPlayingPause"
            visible: _nowPlaying.pausable
            icon: _nowPlaying.playing ? "pause" : "play"
            label: _nowPlaying.playing ? qsTr("Pause") : qsTr("Play")
            fill: Theme.surfaceHigh
            active: _nowPlaying.playing ? root.suspend && root.suspend.enabled : root.resume && root.resume.enabled
            onClicked: HmiIntents.requestAction(_nowPlaying.playing ? HmiIntents.SuspendMediaPlayback : HmiIntents.ResumeMediaPlayback)
        }

        IconButton {
            width: Theme.px(88)
            height: width
            objectName: "nowPlayingMute"
            visible: !_nowPlaying.pausable
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
