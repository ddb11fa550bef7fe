// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Hides everything while the vehicle is in someone else's hands.
Rectangle {
    id: root

    property var popupData

    color: Theme.background
    LayoutMirroring.enabled: Theme.mirrored
    LayoutMirroring.childrenInherit: true

    Behavior on color {
        ColorAnimation { duration: Theme.durationLong; easing.type: Theme.easing }
    }

    MouseArea {
        anchors.fill: parent
    }

    Label {
        objectName: "valetClock"
        anchors { right: parent.right; top: parent.top; rightMargin: Theme.margin }
        height: Theme.statusBarHeight
        content: _market.clock(_globalSource.clockText)
        font.weight: Font.DemiBold
    }

    Column {
        anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter; margins: Theme.margin }
        spacing: Theme.gap

        Rectangle {
            anchors.horizontalCenter: parent.horizontalCenter
            width: Theme.px(180)
            height: width
            radius: width / 2
            color: Theme.accentSoft

            Icon {
                anchors.centerIn: parent
                name: "key"
                size: Theme.px(92)
                color: Theme.accent
            }
        }

        Label {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            content: qsTr("Valet mode")
            font.pixelSize: Theme.px(44)
            font.weight: Font.DemiBold
        }

        Label {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            wrapMode: Text.Wrap
            maximumLineCount: 2
            content: qsTr("Personal data is hidden and the volume keys are locked.")
            color: Theme.textMuted
        }

        Item {
            width: 1
            height: Theme.gap
        }

        PushButton {
            objectName: "leaveValet"
            anchors.horizontalCenter: parent.horizontalCenter
            width: Theme.px(420)
            text: qsTr("Leave valet mode")
            color: Theme.surface
            onClicked: _valetModeSource.setValetMode(false)
        }
    }
}
