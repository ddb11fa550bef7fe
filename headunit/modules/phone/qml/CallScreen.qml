// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The call that runs or is being set up.
Screen {
    id: root

    readonly property bool connected: _phoneSource.callConnected
    readonly property string caller: _phoneSource.callerName.length > 0 ? _phoneSource.callerName : _phoneSource.callerNumber

    title: qsTr("Call")

    function clock(seconds) {
        const rest = seconds % 60;
        return Math.floor(seconds / 60) + ":" + (rest < 10 ? "0" : "") + rest;
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
            content: root.connected ? root.clock(_phoneSource.callDuration) : _phoneSource.dialling ? qsTr("Dialling…") : ""
            color: Theme.textMuted
            font.pixelSize: Theme.textTitle
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
            active: root.connected
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
            active: root.connected || _phoneSource.dialling
            onClicked: _phoneSource.hangUp()
        }
    }
}
