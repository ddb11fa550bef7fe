// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// What the voice session asks for, or the text that is spoken.
BottomSheet {
    id: root

    readonly property bool listening: _speechSource.sessionState !== 0
    readonly property bool ready: _speechSource.voiceRecognitionEngineReady

    Rectangle {
        id: mark

        anchors.verticalCenter: parent.verticalCenter
        width: Theme.px(96)
        height: width
        radius: width / 2
        color: root.listening ? Theme.accent : Theme.accentSoft

        Icon {
            anchors.centerIn: parent
            name: root.listening || !root.ready ? "voice" : "volume"
            size: Theme.px(52)
            color: root.listening ? Theme.accentText : Theme.accent
        }
    }

    Column {
        anchors.verticalCenter: parent.verticalCenter
        width: parent.width - mark.width - cancel.width - 2 * root.spacing
        spacing: Theme.gap / 4

        Row {
            width: parent.width
            spacing: Theme.gap
            layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
            LayoutMirroring.enabled: false // mirrored by its layout direction

            Label {
                objectName: "voiceTitle"
                anchors.verticalCenter: parent.verticalCenter
                content: root.listening ? qsTr("Voice control") : root.ready ? qsTr("Spoken message") : qsTr("Voice control is not ready")
                color: Theme.textMuted
            }

            Badge {
                objectName: "voiceStep"
                anchors.verticalCenter: parent.verticalCenter
                visible: root.listening
                text: qsTr("Step %1").arg(_speechSource.sessionState)
            }
        }

        Label {
            objectName: "voicePrompt"
            width: parent.width
            wrapMode: Text.Wrap
            maximumLineCount: 2
            content: _speechSource.promptText
            font.pixelSize: Theme.textTitle
            font.weight: Font.DemiBold
        }
    }

    PushButton {
        id: cancel

        objectName: "cancelVoice"
        anchors.verticalCenter: parent.verticalCenter
        width: Theme.px(200)
        text: root.listening ? qsTr("Cancel") : qsTr("Stop")
        onClicked: root.listening ? _speechSource.cancelVRSession() : _speechSource.cancelTTSSession()
    }
}
