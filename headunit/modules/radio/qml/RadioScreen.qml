// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiCore 1.0
import HmiUi 1.0

/// What is heard of the band, and the six presets of the bank.
Screen {
    id: root

    readonly property var tuner: _radio.tuner

    title: qsTr("Radio")

    Connections {
        target: HardKeyController

        function onSwcSeekDownShortPress() { presets.followWheel(); }
        function onSwcSeekUpShortPress() { presets.followWheel(); }
        function onSwcSeekDownLongPress() { down.held = true; }
        function onSwcSeekDownLongRelease() { down.held = false; }
        function onSwcSeekUpLongPress() { up.held = true; }
        function onSwcSeekUpLongRelease() { up.held = false; }
    }

    SegmentedControl {
        id: bands

        objectName: "bands"
        anchors { left: parent.left; leftMargin: Theme.margin; top: parent.top }
        options: _radio.bands
        current: _radio.band
        onChosen: function (index) { _radio.selectBand(index); }
    }

    Row {
        anchors { right: parent.right; rightMargin: Theme.margin; top: parent.top }
        spacing: Theme.gap

        IconButton {
            objectName: "toggleTraffic"
            visible: _radio.hasAnnouncements
            icon: "traffic"
            iconColor: root.tuner.trafficAnnouncementEnabled ? Theme.accent : Theme.text
            fill: root.tuner.trafficAnnouncementEnabled ? Theme.accentSoft : Theme.surface
            label: qsTr("Traffic announcements")
            onClicked: _radio.toggleTrafficAnnouncements()
        }

        IconButton {
            objectName: "autoStore"
            icon: "autostore"
            label: qsTr("Store the strongest stations")
            fill: Theme.surface
            active: !root.tuner.autoStoreInProgress
            onClicked: root.tuner.startAutoStore()
        }

        IconButton {
            objectName: "openSound"
            icon: "sound"
            label: qsTr("Sound")
            fill: Theme.surface
            onClicked: _viewManager.requestView("RADIO.Sound")
        }

        IconButton {
            objectName: "openStations"
            icon: "list"
            label: qsTr("Stations")
            fill: Theme.surface
            onClicked: _viewManager.requestView("RADIO.Stations")
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
        id: station

        anchors { left: parent.left; right: parent.right; top: bands.bottom; bottom: lowerEdge.top; margins: Theme.margin }

        IconButton {
            id: down

            property bool held: false // on the steering wheel

            objectName: "seekDown"
            anchors { left: parent.left; verticalCenter: parent.verticalCenter }
            width: Theme.px(96)
            height: width
            iconSize: Theme.px(44)
            icon: "seek-down"
            label: qsTr("Seek down")
            mirrorsWithLayout: true
            fill: held ? Theme.accentSoft : Theme.surface
            onClicked: _radio.seekDown()
        }

        StationDisplay {
            anchors { left: down.right; right: up.left; margins: Theme.margin; verticalCenter: parent.verticalCenter }
            visible: !_radio.satellite
            tuner: root.tuner
            heardOnFm: _radio.fm
        }

        SatelliteDisplay {
            anchors { left: down.right; right: up.left; margins: Theme.margin; verticalCenter: parent.verticalCenter }
            visible: _radio.satellite
        }

        IconButton {
            id: up

            property bool held: false // on the steering wheel

            objectName: "seekUp"
            anchors { right: parent.right; verticalCenter: parent.verticalCenter }
            width: Theme.px(96)
            height: width
            iconSize: Theme.px(44)
            icon: "seek-up"
            label: qsTr("Seek up")
            mirrorsWithLayout: true
            fill: held ? Theme.accentSoft : Theme.surface
            onClicked: _radio.seekUp()
        }
    }

    Item {
        id: lowerEdge

        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.margin }
        height: Theme.px(124)

        PresetBar {
            id: presets

            anchors.fill: parent
            visible: !autoStore.visible
            tuner: root.tuner
        }

        AutoStoreBar {
            id: autoStore

            anchors.fill: parent
            visible: root.tuner.autoStoreInProgress
            progress: root.tuner.autoStoreProgress
            onCancelled: root.tuner.sendAutoStoreCancel()
        }
    }
}
