// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Title of the view on the one side, state of the vehicle and the phone on the other.
Item {
    id: root

    height: Theme.statusBarHeight

    Label {
        objectName: "statusTitle"
        anchors { left: parent.left; leftMargin: Theme.margin; right: indicators.left; rightMargin: Theme.gap; verticalCenter: parent.verticalCenter }
        content: _viewManager.currentItem && _viewManager.currentItem.title ? _viewManager.currentItem.title : ""
        font.weight: Font.DemiBold
    }

    Row {
        id: indicators

        anchors { right: parent.right; rightMargin: Theme.margin; verticalCenter: parent.verticalCenter }
        spacing: Theme.gap * 1.25

        IconButton {
            objectName: "openSearch"
            anchors.verticalCenter: parent.verticalCenter
            icon: "search"
            label: qsTr("Search")
            onClicked: _viewManager.requestView("SYSTEM.Search")
        }

        Icon {
            objectName: "statusDisconnected"
            anchors.verticalCenter: parent.verticalCenter
            visible: !_bridgeConnection.connected
            name: "disconnected"
            size: Theme.px(28)
            color: Theme.negative
        }

        TurnChip {
            anchors.verticalCenter: parent.verticalCenter
        }

        CallChip {
            anchors.verticalCenter: parent.verticalCenter
        }

        Icon {
            objectName: "statusEmergency"
            anchors.verticalCenter: parent.verticalCenter
            visible: _eaPhoneSource.eventsBlocked
            name: "emergency"
            size: Theme.px(28)
            color: Theme.negative
        }

        Icon {
            objectName: "statusMuted"
            anchors.verticalCenter: parent.verticalCenter
            visible: _globalSource.muted
            name: "mute"
            size: Theme.px(28)
        }

        Row {
            anchors.verticalCenter: parent.verticalCenter
            visible: _phoneSource.deviceName.length > 0
            spacing: Theme.gap / 2

            Icon {
                anchors.verticalCenter: parent.verticalCenter
                name: "bluetooth"
                size: Theme.px(26)
                color: Theme.textMuted
            }

            SignalBars {
                anchors.verticalCenter: parent.verticalCenter
                level: _phoneSource.signalStrength
            }
        }

        Label {
            anchors.verticalCenter: parent.verticalCenter
            visible: _bridgeConnection.connected
            content: _market.temperature(_globalSource.outsideTemperature)
            color: Theme.textMuted
        }

        Label {
            objectName: "statusClock"
            anchors.verticalCenter: parent.verticalCenter
            content: _market.clock(_globalSource.clockText)
            font.weight: Font.DemiBold
        }
    }
}
