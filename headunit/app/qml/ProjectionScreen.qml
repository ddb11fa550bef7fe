// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Where the projected phone draws; this stands in for it.
Screen {
    id: root

    readonly property bool projecting: _projectionSource.projectionMode !== 0

    title: qsTr("Phone screen")

    Rectangle {
        anchors { fill: parent; leftMargin: Theme.margin; rightMargin: Theme.margin; bottomMargin: Theme.margin }
        radius: Theme.radius
        color: Theme.dark

        Column {
            anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter; margins: Theme.margin }
            spacing: Theme.gap

            Icon {
                anchors.horizontalCenter: parent.horizontalCenter
                name: "projection"
                size: Theme.px(110)
                color: Theme.lightOnDark
            }

            Label {
                objectName: "projectedDevice"
                width: parent.width
                horizontalAlignment: Text.AlignHCenter
                content: root.projecting ? _projectionSource.projectedDeviceName : qsTr("No phone is projected")
                color: Theme.lightOnDark
                font.pixelSize: Theme.px(44)
                font.weight: Font.DemiBold
            }

            Label {
                width: parent.width
                horizontalAlignment: Text.AlignHCenter
                wrapMode: Text.Wrap
                maximumLineCount: 2
                visible: root.projecting
                content: _projectionSource.projectionMode === 1 ? qsTr("The phone on the cable draws here.") : qsTr("The phone draws here, without cable.")
                color: Theme.mutedOnDark
            }

            Label {
                objectName: "projectedSong"
                width: parent.width
                horizontalAlignment: Text.AlignHCenter
                visible: content.length > 0
                content: _projectionSource.projectedPlaying ? _projectionSource.projectedTitle : ""
                color: Theme.lightOnDark
            }

            Label {
                objectName: "projectedCall"
                width: parent.width
                horizontalAlignment: Text.AlignHCenter
                visible: _projectionSource.dioCallStatus !== 0
                content: qsTr("Call on the projected phone")
                color: Theme.lightOnDark
            }
        }
    }
}
