// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The call that runs or is being set up.
Screen {
    id: root

    readonly property bool connected: _phoneSource.callConnected
    readonly property string caller: _phoneSource.callerName.length > 0 ? _phoneSource.callerName : _phoneSource.callerNumber.length > 0 ? _phoneSource.callerNumber : qsTr("Unknown caller")

    readonly property bool blocked: _eaPhoneSource.eventsBlocked

    title: qsTr("Call")

    EmergencyNote {
        anchors { left: parent.left; right: parent.right; top: parent.top; leftMargin: Theme.margin; rightMargin: Theme.margin }
    }

    Column {
        anchors { left: parent.left; right: parent.right; margins: Theme.margin; verticalCenter: parent.verticalCenter; verticalCenterOffset: -Theme.px(60) }
        spacing: Theme.gap

        Rectangle {
            anchors.horizontalCenter: parent.horizontalCenter
            width: Theme.px(140)
            height: width
            radius: width / 2
            color: Theme.accentSoft

            Icon {
                anchors.centerIn: parent
                name: "contacts"
                size: Theme.px(76)
                color: Theme.accent
            }
        }

        Label {
            objectName: "caller"
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            content: root.connected || _phoneSource.dialling ? root.caller : qsTr("No call")
            font.pixelSize: Theme.px(44)
            font.weight: Font.DemiBold
        }

        Label {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            objectName: "callState"
            content: root.connected ? Format.duration(_phoneSource.callDuration) : _phoneSource.dialling ? qsTr("Dialling…") : ""
            color: Theme.textMuted
            font.pixelSize: Theme.textTitle
        }

        Label {
            objectName: "privateNote"
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            visible: root.connected && _phoneSource.privateMode
            content: qsTr("Heard on the phone, not in the car")
            color: Theme.accent
        }
    }

    Row {
        anchors { horizontalCenter: parent.horizontalCenter; bottom: parent.bottom; bottomMargin: Theme.margin * 2 }
        spacing: Theme.gap

        PushButton {
            objectName: "privateMode"
            width: Theme.px(340)
            text: _phoneSource.privateMode ? qsTr("Back to the car") : qsTr("On the phone")
            icon: _phoneSource.privateMode ? "volume" : "phone"
            active: root.connected && !root.blocked
            color: Theme.surface
            onClicked: _phoneSource.setPrivateMode(!_phoneSource.privateMode)
        }

        PushButton {
            objectName: "hangUp"
            width: Theme.px(340)
            text: qsTr("End call")
            icon: "phone-hangup"
            color: Theme.negative
            textColor: Theme.signalText
            active: (root.connected || _phoneSource.dialling) && !root.blocked
            onClicked: _phoneSource.hangUp()
        }
    }
}
