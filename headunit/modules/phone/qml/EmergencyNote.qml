// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Tells that an emergency call keeps the phone away.
Rectangle {
    id: root

    visible: _eaPhoneSource.eventsBlocked
    height: visible ? Theme.touchTarget : 0
    radius: Theme.radius / 2
    color: Theme.negative

    Icon {
        id: mark

        anchors { left: parent.left; leftMargin: Theme.gap; verticalCenter: parent.verticalCenter }
        name: "emergency"
        color: Theme.signalText
    }

    Label {
        objectName: "emergencyNote"
        anchors { left: mark.right; right: parent.right; leftMargin: Theme.gap; rightMargin: Theme.gap; verticalCenter: parent.verticalCenter }
        content: qsTr("An emergency call is running. The phone cannot be used.")
        color: Theme.signalText
        font.weight: Font.DemiBold
    }
}
