// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The phone's own assistant or voice dialling listens.
BottomSheet {
    id: root

    Rectangle {
        id: mark

        anchors.verticalCenter: parent.verticalCenter
        width: Theme.px(96)
        height: width
        radius: width / 2
        color: Theme.accent

        Icon {
            anchors.centerIn: parent
            name: "voice"
            size: Theme.px(52)
            color: Theme.accentText
        }
    }

    Column {
        anchors.verticalCenter: parent.verticalCenter
        width: parent.width - mark.width - stop.width - 2 * root.spacing
        spacing: Theme.gap / 4

        Label {
            objectName: "assistantTitle"
            width: parent.width
            content: _phoneSource.siriActive ? qsTr("The phone's assistant is listening") : qsTr("The phone's voice dialling is listening")
            font.pixelSize: Theme.textTitle
            font.weight: Font.DemiBold
        }

        Label {
            width: parent.width
            content: _phoneSource.deviceName
            color: Theme.textMuted
        }
    }

    PushButton {
        id: stop

        objectName: "stopAssistant"
        anchors.verticalCenter: parent.verticalCenter
        width: Theme.px(200)
        text: qsTr("Stop")
        onClicked: _phoneSource.siriActive ? _phoneSource.toggleSiriActivation(false) : _phoneSource.togglePhoneVoiceServiceActivation(false)
    }
}
