// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// What the player, the disc or the projected phone plays.
Screen {
    id: root

    title: qsTr("Media")

    SegmentedControl {
        id: kinds

        objectName: "kinds"
        anchors { left: parent.left; leftMargin: Theme.margin; top: parent.top }
        options: _media.kinds
        current: _media.kind
        onChosen: function (index) { _media.selectKind(index); }
    }

    Row {
        anchors { right: parent.right; rightMargin: Theme.margin; top: parent.top }
        spacing: Theme.gap

        IconButton {
            objectName: "openLibrary"
            visible: _media.kind !== 2
            icon: "list"
            label: _media.kind === 1 ? qsTr("Tracks") : qsTr("Library")
            fill: Theme.surface
            active: _media.available
            onClicked: _viewManager.requestView(_media.kind === 1 ? "MEDIA.Disc" : "MEDIA.Library")
        }

        IconButton {
            objectName: "openSources"
            icon: "source"
            label: qsTr("Sources")
            fill: Theme.surface
            onClicked: _viewManager.requestPopup("SYSTEM.AudioSources")
        }
    }

    Item {
        id: stage

        anchors { left: parent.left; right: parent.right; top: kinds.bottom; bottom: progress.top; margins: Theme.margin }

        EmptyNote {
            objectName: "mediaNotice"
            anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter }
            visible: !_media.available
            icon: _media.icon
            text: _media.notice
            detail: _media.kind === 1 ? qsTr("Insert a disc to play it.") : ""
        }

        CoverArt {
            id: cover

            anchors { left: parent.left; verticalCenter: parent.verticalCenter }
            width: Math.min(parent.height, Theme.px(360))
            height: width
            visible: _media.available
            icon: _media.icon
            lit: _media.heard
        }

        Column {
            anchors { left: cover.right; right: parent.right; leftMargin: Theme.margin * 1.5; verticalCenter: parent.verticalCenter }
            visible: _media.available
            spacing: Theme.gap / 2

            Label {
                objectName: "mediaTitle"
                width: parent.width
                content: _media.title
                font.pixelSize: Theme.px(44)
                font.weight: Font.DemiBold
                wrapMode: Text.Wrap
                maximumLineCount: 2
            }

            Label {
                objectName: "mediaArtist"
                width: parent.width
                content: _media.artist
                font.pixelSize: Theme.textTitle
                wrapMode: Text.Wrap
                maximumLineCount: 2
            }

            Label {
                objectName: "mediaAlbum"
                width: parent.width
                content: _media.album
                color: Theme.textMuted
                wrapMode: Text.Wrap
                maximumLineCount: 2
            }
        }
    }

    Item {
        id: progress

        anchors { left: parent.left; right: parent.right; bottom: keys.top; leftMargin: Theme.margin; rightMargin: Theme.margin; bottomMargin: Theme.gap }
        height: Theme.touchTarget
        visible: _media.available && _media.duration > 0
        LayoutMirroring.enabled: false // time goes from left to right everywhere
        LayoutMirroring.childrenInherit: true

        Label {
            id: elapsed

            objectName: "mediaPosition"
            anchors { left: parent.left; verticalCenter: parent.verticalCenter }
            width: Theme.px(88)
            content: Format.duration(_media.position)
            color: Theme.textMuted
        }

        Slider {
            objectName: "mediaSlider"
            anchors { left: elapsed.right; right: total.left; verticalCenter: parent.verticalCenter }
            visible: _media.kind === 0
            to: _media.duration
            value: _media.position
            mirrored: false
            label: qsTr("Position in the track")
            onMoved: function (value) { _media.seekTo(value); }
        }

        ProgressBar {
            anchors { left: elapsed.right; right: total.left; verticalCenter: parent.verticalCenter }
            visible: _media.kind === 1
            value: _media.position
            to: _media.duration
            mirrored: false
            label: qsTr("Position in the track")
        }

        Label {
            id: total

            anchors { right: parent.right; verticalCenter: parent.verticalCenter }
            width: Theme.px(88)
            horizontalAlignment: Text.AlignRight
            content: Format.duration(_media.duration)
            color: Theme.textMuted
        }
    }

    TransportKeys {
        id: keys

        anchors { horizontalCenter: parent.horizontalCenter; bottom: parent.bottom; bottomMargin: Theme.margin }
    }
}
