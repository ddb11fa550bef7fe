// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The screen behind the tile.
Screen {
    title: qsTr("Sample")

    Card {
        anchors { fill: parent; leftMargin: Theme.margin; rightMargin: Theme.margin; bottomMargin: Theme.margin }

        Column {
            anchors.centerIn: parent
            spacing: Theme.margin

            Label {
                objectName: "counted"
                anchors.horizontalCenter: parent.horizontalCenter
                content: qsTr("Counted: %1").arg(_sampleCounter.value)
                font.pixelSize: Theme.textDisplay
            }

            PushButton {
                objectName: "count"
                anchors.horizontalCenter: parent.horizontalCenter
                text: qsTr("Count")
                primary: true
                onClicked: _sampleCounter.increase()
            }
        }
    }
}
