// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiApps 1.0
import HmiIntents 1.0
import HmiUi 1.0

/// The phone that projects its screen, or how to get one to.
Card {
    id: root

    readonly property bool connected: _projectionPresence.connected
    readonly property bool onCable: _projectionPresence.kind === ProjectionPresence.Cable

    Column {
        anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.margin }
        spacing: Theme.gap

        Rectangle {
            anchors.horizontalCenter: parent.horizontalCenter
            width: Theme.px(140)
            height: width
            radius: width / 2
            color: root.connected ? Theme.accent : Theme.accentSoft

            Icon {
                anchors.centerIn: parent
                name: "projection"
                size: Theme.px(76)
                color: root.connected ? Theme.accentText : Theme.accent
            }
        }

        Label {
            objectName: "appsPhone"
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            wrapMode: Text.Wrap
            maximumLineCount: 2
            content: !root.connected ? qsTr("No phone is projected") : _projectionPresence.phoneName.length > 0 ? _projectionPresence.phoneName : qsTr("Your phone")
            font.pixelSize: Theme.textTitle
            font.weight: Font.DemiBold
        }

        Row {
            anchors.horizontalCenter: parent.horizontalCenter
            visible: root.connected
            spacing: Theme.gap / 2

            Icon {
                anchors.verticalCenter: parent.verticalCenter
                name: root.onCable ? "cable" : "wireless"
                color: Theme.textMuted
            }

            Label {
                objectName: "appsPhoneKind"
                anchors.verticalCenter: parent.verticalCenter
                content: root.onCable ? qsTr("On the cable") : qsTr("Without cable")
                color: Theme.textMuted
            }
        }

        Label {
            objectName: "appsPhoneSong"
            width: parent.width
            visible: _projectionSource.projectedPlaying && _projectionSource.projectedTitle.length > 0
            horizontalAlignment: Text.AlignHCenter
            content: _projectionSource.projectedTitle
            color: Theme.accent
        }

        Label {
            objectName: "appsHint"
            width: parent.width
            visible: !root.connected
            horizontalAlignment: Text.AlignHCenter
            wrapMode: Text.Wrap
            maximumLineCount: 6
            content: _projectionPresence.offered ? qsTr("Connect the phone by its cable, or switch on its wireless projection near the car.") : qsTr("Projection is not offered in this market.")
            color: Theme.textMuted
        }

        Label {
            objectName: "appsLeaveHint"
            width: parent.width
            visible: root.connected
            horizontalAlignment: Text.AlignHCenter
            wrapMode: Text.Wrap
            maximumLineCount: 3
            content: root.onCable ? qsTr("Unplug the cable to end it.") : qsTr("End it on the phone.")
            color: Theme.textMuted
        }
    }

    PushButton {
        objectName: "showPhoneScreen"
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.margin }
        visible: root.connected
        primary: true
        icon: "projection"
        text: qsTr("Show its screen")
        onClicked: HmiIntents.requestAction(HmiIntents.ShowProjection)
    }
}
