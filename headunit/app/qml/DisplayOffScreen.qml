// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiIntents 1.0
import HmiUi 1.0

/// The dark display. A touch lights it and does nothing else.
Rectangle {
    id: root

    property var popupData

    color: Theme.dark

    MouseArea {
        objectName: "touchArea"
        anchors.fill: parent
        onClicked: HmiIntents.requestAction(HmiIntents.ExitDisplayOffMode)
    }
}
