// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Frequency, station and text of an AM, FM or DAB tuner, and how it is received.
Column {
    id: root

    property var tuner
    property bool heardOnFm: false
    readonly property bool hdLost: _fmTuner.hdSignalLossStatus !== 0

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
        content: root.tuner.tpSeekInProgress ? qsTr("Searching for traffic announcements…") : root.tuner.seeking ? qsTr("Searching…") : root.tuner.stationName
        font.pixelSize: Theme.textTitle
        font.weight: Font.DemiBold
    }

    Label {
        objectName: "radioText"
        width: parent.width
        horizontalAlignment: Text.AlignHCenter
        wrapMode: Text.Wrap
        maximumLineCount: 2
        content: root.tuner.radioText
        color: Theme.textMuted
    }

    Row {
        anchors.horizontalCenter: parent.horizontalCenter
        height: Theme.px(48)
        spacing: Theme.gap

        Badge {
            objectName: "hdBadge"
            anchors.verticalCenter: parent.verticalCenter
            visible: root.heardOnFm && (_fmTuner.hdAvailable || root.hdLost)
            text: root.hdLost ? qsTr("HD lost") : qsTr("HD")
            lit: !root.hdLost
        }

        Badge {
            objectName: "stereoBadge"
            anchors.verticalCenter: parent.verticalCenter
            visible: root.heardOnFm && _fmTuner.stereo
            text: qsTr("Stereo")
        }

        Badge {
            objectName: "taBadge"
            anchors.verticalCenter: parent.verticalCenter
            visible: root.tuner.trafficAnnouncementEnabled || root.tuner.tpSeekInProgress
            text: qsTr("TA")
            lit: !root.tuner.tpSeekInProgress
            busy: root.tuner.tpSeekInProgress
        }

        SignalBars {
            objectName: "radioSignal"
            anchors.verticalCenter: parent.verticalCenter
            level: Math.ceil(root.tuner.signalStrength / 20)
        }
    }
}
