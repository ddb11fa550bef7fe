// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiIntents 1.0
import HmiUi 1.0

/// A traffic announcement that interrupts what is heard.
BottomSheet {
    id: root

    readonly property HmiIntentMonitor cancelling: HmiIntents.intentMonitor(HmiIntents.CancelAnnouncement)

    Rectangle {
        id: mark

        anchors.verticalCenter: parent.verticalCenter
        width: Theme.px(96)
        height: width
        radius: width / 2
        color: Theme.accentSoft

        Icon {
            anchors.centerIn: parent
            name: "traffic"
            size: Theme.px(52)
            color: Theme.accent
        }
    }

    Column {
        anchors.verticalCenter: parent.verticalCenter
        width: parent.width - mark.width - cancel.width - 2 * root.spacing
        spacing: Theme.gap / 4

        Label {
            width: parent.width
            content: qsTr("Traffic announcement")
            font.pixelSize: Theme.textTitle
            font.weight: Font.DemiBold
        }

        Label {
            objectName: "announcer"
            width: parent.width
            content: _radio.announcer
            color: Theme.accent
        }

        Label {
            objectName: "announcementText"
            width: parent.width
            visible: content.length > 0
            wrapMode: Text.Wrap
            maximumLineCount: 2
            content: _radio.announcement
            color: Theme.textMuted
        }
    }

    PushButton {
        id: cancel

        objectName: "cancelAnnouncement"
        anchors.verticalCenter: parent.verticalCenter
        width: Theme.px(200)
        text: qsTr("Cancel")
        active: root.cancelling.enabled
        onClicked: _radio.cancelAnnouncement()
    }
}
