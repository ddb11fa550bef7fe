// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

PopupCard {
    id: root

    readonly property bool known: _phoneSource.callerName.length > 0

    title: qsTr("Incoming call")
    icon: "phone"
    iconColor: Theme.positive

    Label {
        objectName: "incomingCaller"
        width: parent.width
        content: root.known ? _phoneSource.callerName : _phoneSource.callerNumber.length > 0 ? _phoneSource.callerNumber : qsTr("Unknown caller")
        font.pixelSize: Theme.px(44)
        font.weight: Font.DemiBold
    }

    Label {
        width: parent.width
        visible: root.known
        content: _phoneSource.callerNumber
        color: Theme.textMuted
    }

    Row {
        width: parent.width
        spacing: Theme.gap

        PushButton {
            objectName: "acceptCall"
            width: (parent.width - Theme.gap) / 2
            text: qsTr("Accept")
            icon: "phone"
            color: Theme.positive
            textColor: Theme.signalText
            onClicked: _phoneSource.acceptCall()
        }

        PushButton {
            objectName: "rejectCall"
            width: (parent.width - Theme.gap) / 2
            text: qsTr("Reject")
            icon: "phone-hangup"
            color: Theme.negative
            textColor: Theme.signalText
            onClicked: _phoneSource.rejectCall()
        }
    }
}
