// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The phone's page in the settings.
Screen {
    title: qsTr("Phone settings")

    Card {
        anchors { left: parent.left; right: parent.right; top: parent.top; leftMargin: Theme.margin; rightMargin: Theme.margin }
        height: column.implicitHeight + 2 * Theme.gap

        Column {
            id: column

            anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.gap }

            ListRow {
                icon: "bluetooth"
                title: qsTr("Connected phone")
                value: _phoneSource.deviceName.length > 0 ? _phoneSource.deviceName : qsTr("None")
                active: false
            }

            ListRow {
                icon: "contacts"
                title: qsTr("Contacts")
                value: _phoneSource.contacts.length
                active: false
            }

            ListRow {
                icon: "volume"
                title: qsTr("Calls on the phone's own loudspeaker")

                Toggle {
                    objectName: "privateModeToggle"
                    label: qsTr("Calls on the phone's own loudspeaker")
                    on: _phoneSource.privateMode
                    onToggled: function (on) { _phoneSource.setPrivateMode(on); }
                }

                onClicked: _phoneSource.setPrivateMode(!_phoneSource.privateMode)
            }
        }
    }
}
