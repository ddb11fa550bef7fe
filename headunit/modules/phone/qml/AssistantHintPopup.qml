// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The push-to-talk key was held for an assistant that the phone has switched off.
PopupCard {
    id: root

    title: qsTr("The assistant is switched off")
    icon: "voice"
    dismissible: true
    onDismissed: _viewManager.closePopup("PHONE.AssistantHint")

    Label {
        objectName: "assistantHint"
        width: parent.width
        wrapMode: Text.Wrap
        maximumLineCount: 4
        content: _phoneSource.deviceName.length > 0 ? qsTr("Switch it on in the settings of %1, then hold the voice key again.").arg(_phoneSource.deviceName) : qsTr("Switch it on in the settings of the phone, then hold the voice key again.")
        color: Theme.textMuted
    }
}
