// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// What this head unit is made of.
Screen {
    title: qsTr("About")

    Card {
        anchors { left: parent.left; right: parent.right; top: parent.top; leftMargin: Theme.margin; rightMargin: Theme.margin }
        height: column.implicitHeight + 2 * Theme.gap

        Column {
            id: column

            anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.gap }

            ListRow {
                title: qsTr("Head unit")
                value: Qt.application.version
                active: false
            }

            ListRow {
                title: qsTr("Qt")
                value: _qtVersion
                active: false
            }

            ListRow {
                title: qsTr("Modules")
                value: _menuModuleCollection.rowCount()
                active: false
            }

            ListRow {
                title: qsTr("Vehicle")
                value: _bridgeConnection.connected ? qsTr("Connected") : qsTr("Not connected")
                active: false
            }
        }
    }
}
