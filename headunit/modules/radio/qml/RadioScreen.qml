// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The station that is heard, and the six presets of the bank.
Screen {
    id: root

    readonly property QtObject tuner: _radio.tuner

    title: qsTr("Radio")

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
    }

    Item {
        id: station

        anchors { left: parent.left; right: parent.right; top: bands.bottom; bottom: presets.top; margins: Theme.margin }

        IconButton {
            id: down

            objectName: "seekDown"
            anchors { left: parent.left; verticalCenter: parent.verticalCenter }
            width: Theme.px(96)
            height: width
            iconSize: Theme.px(44)
            icon: "seek-down"
            label: qsTr("Seek down")
            mirrorsWithLayout: true
            fill: Theme.surface
            onClicked: _radio.seekDown()
        }

        Column {
            anchors { left: down.right; right: up.left; margins: Theme.margin; verticalCenter: parent.verticalCenter }
            spacing: Theme.gap / 2

            Row {
                anchors.horizontalCenter: parent.horizontalCenter
                spacing: Theme.gap
                LayoutMirroring.enabled: false // a number and its unit read from left to right everywhere

                Label {
                    id: frequency

                    objectName: "frequency"
                    content: root.tuner.frequency
                    font.pixelSize: Theme.textDisplay
                    font.weight: Font.Light
                }

                Label {
                    anchors.baseline: frequency.baseline
                    content: root.tuner.frequencyUnit
                    color: Theme.textMuted
                    font.pixelSize: Theme.textTitle
                }
            }

            Label {
                objectName: "stationName"
                width: parent.width
                horizontalAlignment: Text.AlignHCenter
                content: root.tuner.seeking ? qsTr("Searching…") : root.tuner.stationName
                font.pixelSize: Theme.textTitle
                font.weight: Font.DemiBold
            }

            Label {
                width: parent.width
                horizontalAlignment: Text.AlignHCenter
                wrapMode: Text.Wrap
                maximumLineCount: 2
                content: root.tuner.radioText
                color: Theme.textMuted
            }

            Row {
                anchors.horizontalCenter: parent.horizontalCenter
                spacing: Theme.gap / 2
                visible: root.tuner.trafficAnnouncementEnabled

                Rectangle {
                    width: badge.implicitWidth + Theme.gap
                    height: badge.implicitHeight + Theme.gap / 4
                    radius: Theme.px(6)
                    color: Theme.accentSoft

                    Label {
                        id: badge

                        anchors.centerIn: parent
                        content: qsTr("TA")
                        color: Theme.accent
                        font.pixelSize: Theme.textCaption
                        font.weight: Font.Bold
                    }
                }
            }
        }

        IconButton {
            id: up

            objectName: "seekUp"
            anchors { right: parent.right; verticalCenter: parent.verticalCenter }
            width: Theme.px(96)
            height: width
            iconSize: Theme.px(44)
            icon: "seek-up"
            label: qsTr("Seek up")
            mirrorsWithLayout: true
            fill: Theme.surface
            onClicked: _radio.seekUp()
        }
    }

    Row {
        id: presets

        readonly property real tileWidth: (width - 5 * spacing) / 6

        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.margin }
        spacing: Theme.gap
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
        LayoutMirroring.enabled: false // mirrored by its layout direction

        Repeater {
            model: 6

            PresetTile {
                objectName: "preset" + (index + 1)
                width: presets.tileWidth
                number: index + 1
                preset: root.presetAt(index)
                current: root.tuner.activePreset === index + 1
                onClicked: _radio.recallPreset(number)
                onHeld: _radio.storePreset(number)
            }
        }
    }

    /// The preset in a place of the active bank, or an empty object.
    function presetAt(place) {
        const all = root.tuner.presets;
        for (let i = 0; i < all.length; ++i)
            if (all[i].bank === root.tuner.activePresetBank && all[i].index === place + 1)
                return all[i];
        return {};
    }
}
