// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The satellite channel and what it plays, live or from the replay buffer.
Column {
    id: root

    readonly property bool replaying: _xmTuner.replayStatus !== 0
    readonly property bool playing: _xmTuner.playStatus !== 0

    spacing: Theme.gap / 2

    Row {
        anchors.horizontalCenter: parent.horizontalCenter
        spacing: Theme.gap
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
        LayoutMirroring.enabled: false // mirrored by its layout direction

        Label {
            id: channel

            objectName: "channelNumber"
            content: _xmTuner.channelNumber
            font.pixelSize: Theme.textDisplay
            font.weight: Font.Light
        }

        Column {
            anchors.verticalCenter: channel.verticalCenter
            width: Math.min(Math.max(name.implicitWidth, category.implicitWidth), Theme.px(460))

            Label {
                id: name

                objectName: "channelName"
                content: _xmTuner.seeking ? qsTr("Searching…") : _xmTuner.stationName
                width: parent.width
                font.pixelSize: Theme.textTitle
                font.weight: Font.DemiBold
            }

            Label {
                id: category

                objectName: "channelCategory"
                width: parent.width
                content: _xmTuner.category
                color: Theme.textMuted
            }
        }
    }

    Label {
        objectName: "satelliteTitle"
        width: parent.width
        horizontalAlignment: Text.AlignHCenter
        content: _xmTuner.title
        font.pixelSize: Theme.textTitle
    }

    Label {
        objectName: "satelliteArtist"
        width: parent.width
        horizontalAlignment: Text.AlignHCenter
        content: _xmTuner.artist
        color: Theme.textMuted
    }

    Row {
        anchors.horizontalCenter: parent.horizontalCenter
        visible: root.replaying && _xmTuner.replayLength > 0
        height: Theme.px(36)
        spacing: Theme.gap
        LayoutMirroring.enabled: false // time goes from left to right everywhere

        ProgressBar {
            anchors.verticalCenter: parent.verticalCenter
            width: Theme.px(360)
            mirrored: false
            value: _xmTuner.replayLength - _xmTuner.replayOffset
            to: _xmTuner.replayLength
            label: qsTr("Place in what can be replayed")
        }

        Label {
            objectName: "replayOffset"
            anchors.verticalCenter: parent.verticalCenter
            content: "−" + Format.duration(_xmTuner.replayOffset)
            color: Theme.textMuted
            font.pixelSize: Theme.textCaption
        }
    }

    Row {
        anchors.horizontalCenter: parent.horizontalCenter
        height: Theme.touchTarget + Theme.gap
        spacing: Theme.gap
        LayoutMirroring.enabled: false // and so go its keys

        Badge {
            objectName: "replayBadge"
            anchors.verticalCenter: parent.verticalCenter
            text: root.replaying ? qsTr("Replay") : qsTr("Live")
        }

        IconButton {
            objectName: "replayPrevious"
            anchors.verticalCenter: parent.verticalCenter
            icon: "skip-previous"
            label: root.replaying ? qsTr("Previous title") : qsTr("Replay the previous title")
            fill: Theme.surface
            onClicked: root.replaying ? _xmTuner.seekReverseShort() : _xmTuner.startReplay()
        }

        IconButton {
            objectName: "replayPlayPause"
            anchors.verticalCenter: parent.verticalCenter
            icon: root.playing ? "pause" : "play"
            label: root.playing ? qsTr("Pause") : qsTr("Play")
            fill: Theme.surface
            onClicked: _xmTuner.togglePlayPause(root.playing ? 0 : 1)
        }

        IconButton {
            objectName: "replayNext"
            anchors.verticalCenter: parent.verticalCenter
            icon: "skip-next"
            label: qsTr("Next title")
            fill: Theme.surface
            active: root.replaying
            onClicked: _xmTuner.seekForwardShort()
        }

        PushButton {
            objectName: "goLive"
            anchors.verticalCenter: parent.verticalCenter
            text: qsTr("Live")
            color: Theme.surface
            active: root.replaying
            onClicked: _xmTuner.goLive()
        }
    }
}
