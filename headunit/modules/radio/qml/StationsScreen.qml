// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// All stations of the band that can be received.
Screen {
    id: root

    readonly property var tuner: _radio.tuner

    title: qsTr("Stations")

    Card {
        anchors { fill: parent; leftMargin: Theme.margin; rightMargin: Theme.margin; bottomMargin: Theme.margin }
    }

    Label {
        anchors.centerIn: parent
        visible: list.count === 0
        content: qsTr("No stations can be received")
        color: Theme.textMuted
    }

    ScrollList {
        id: list

        objectName: "stationList"
        anchors {
            fill: parent
            leftMargin: Theme.margin + Theme.gap; rightMargin: Theme.margin + Theme.gap
            topMargin: Theme.gap; bottomMargin: Theme.margin + Theme.gap
        }
        model: root.tuner.stationList

        delegate: ListRow {
            objectName: "station" + index
            width: list.width
            icon: "radio"
            title: modelData.name ? modelData.name : modelData.frequency
            value: modelData.name ? modelData.frequency : ""
            selected: modelData.frequency === root.tuner.frequency
            onClicked: root.tuner.tuneToStation(index)
        }
    }
}
