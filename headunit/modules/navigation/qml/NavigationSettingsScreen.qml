// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The navigation's page in the settings.
Screen {
    title: qsTr("Navigation settings")

    Card {
        anchors { left: parent.left; right: parent.right; top: parent.top; leftMargin: Theme.margin; rightMargin: Theme.margin }
        height: column.implicitHeight + 2 * Theme.gap

        Column {
            id: column

            anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.gap }

            ListRow {
                objectName: "avoidMotorways"
                icon: "turn-straight"
                title: qsTr("Avoid motorways")
                onClicked: _navigation.avoidMotorways = !_navigation.avoidMotorways

                Toggle {
                    label: qsTr("Avoid motorways")
                    on: _navigation.avoidMotorways
                    onToggled: function (on) { _navigation.avoidMotorways = on; }
                }
            }

            ListRow {
                objectName: "turnsElsewhere"
                icon: "turn-right"
                title: qsTr("Show turns on other screens")
                onClicked: _turnAnnouncer.enabled = !_turnAnnouncer.enabled

                Toggle {
                    label: qsTr("Show turns on other screens")
                    on: _turnAnnouncer.enabled
                    onToggled: function (on) { _turnAnnouncer.enabled = on; }
                }
            }
        }
    }
}
