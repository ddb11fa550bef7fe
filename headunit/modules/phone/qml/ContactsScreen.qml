// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiIntents 1.0
import HmiUi 1.0

/// The phone that is connected, and its contacts.
Screen {
    id: root

    readonly property HmiIntentMonitor calling: HmiIntents.intentMonitor(HmiIntents.MakePhoneCall)

    title: qsTr("Phone")

    EmergencyNote {
        id: emergency

        anchors { left: parent.left; right: parent.right; top: parent.top; leftMargin: Theme.margin; rightMargin: Theme.margin }
    }

    Card {
        id: device

        anchors { left: parent.left; top: emergency.bottom; bottom: parent.bottom; topMargin: emergency.visible ? Theme.gap : 0; leftMargin: Theme.margin; bottomMargin: Theme.margin }
        width: Math.round(parent.width * 0.32)

        Column {
            anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.margin }
            spacing: Theme.gap

            Icon {
                anchors.left: parent.left
                name: "bluetooth"
                size: Theme.px(48)
                color: Theme.accent
            }

            Label {
                width: parent.width
                content: _phoneSource.deviceName.length > 0 ? _phoneSource.deviceName : qsTr("No phone connected")
                font.pixelSize: Theme.textTitle
                font.weight: Font.DemiBold
                wrapMode: Text.Wrap
                maximumLineCount: 2
            }

            Label {
                width: parent.width
                visible: _phoneSource.deviceName.length > 0
                content: qsTr("Battery %1 %").arg(_phoneSource.batteryLevel)
                color: Theme.textMuted
            }
        }

        PushButton {
            objectName: "openKeypad"
            anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.margin }
            icon: "keypad"
            text: qsTr("Keypad")
            active: root.calling.enabled
            onClicked: HmiIntents.requestAction(HmiIntents.MakePhoneCall)
        }
    }

    Card {
        id: contactsCard

        anchors {
            left: device.right; right: parent.right; top: device.top; bottom: parent.bottom
            leftMargin: Theme.gap; rightMargin: Theme.margin; bottomMargin: Theme.margin
        }
    }

    Label {
        anchors.centerIn: contactsCard
        visible: contacts.count === 0
        content: qsTr("No contacts")
        color: Theme.textMuted
    }

    ScrollList {
        id: contacts

        objectName: "contacts"
        anchors { fill: contactsCard; margins: Theme.gap }
        model: _phoneSource.contacts

        delegate: ListRow {
            objectName: "contact" + index
            width: contacts.width
            icon: "contacts"
            title: modelData.name
            subtitle: modelData.number
            active: root.calling.enabled
            dimmed: !root.calling.enabled
            onClicked: HmiIntents.requestAction(HmiIntents.MakePhoneCall, [modelData.number])
        }
    }
}
