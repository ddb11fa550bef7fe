// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Switched off: the time in the dark. A touch switches on, as every hard key does.
Rectangle {
    id: root

    property var popupData

    color: Theme.dark
    LayoutMirroring.enabled: Theme.mirrored
    LayoutMirroring.childrenInherit: true

    Column {
        anchors.centerIn: parent
        spacing: Theme.gap

        Label {
            objectName: "standbyClock"
            anchors.horizontalCenter: parent.horizontalCenter
            content: _market.clock(_globalSource.clockText)
            color: Theme.lightOnDark
            font.pixelSize: Theme.px(120)
            font.weight: Font.Light
        }

        Label {
            anchors.horizontalCenter: parent.horizontalCenter
            content: qsTr("Touch to switch on")
            color: Theme.mutedOnDark
        }
    }

    MouseArea {
        objectName: "touchArea"
        anchors.fill: parent
        onClicked: _globalSource.sendPowerOnOffKeyPressed()
    }
}
