// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Takes the presets' place while they are being filled.
Card {
    id: root

    property int progress: 0 // per cent

    signal cancelled()

    Column {
        anchors { left: parent.left; right: cancel.left; verticalCenter: parent.verticalCenter; margins: Theme.margin }
        spacing: Theme.gap

        Label {
            objectName: "autoStoreText"
            width: parent.width
            content: qsTr("Storing the strongest stations…")
            font.weight: Font.DemiBold
        }

        ProgressBar {
            width: parent.width
            objectName: "autoStoreProgress"
            value: root.progress
            to: 100
            label: qsTr("Storing the strongest stations…")
        }
    }

    PushButton {
        id: cancel

        objectName: "cancelAutoStore"
        anchors { right: parent.right; verticalCenter: parent.verticalCenter; margins: Theme.margin }
        width: Theme.px(220)
        text: qsTr("Cancel")
        onClicked: root.cancelled()
    }
}
