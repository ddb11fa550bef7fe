// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The call that runs while another screen is shown, and the way back to it.
Tappable {
    id: root

    visible: (_phoneSource.callConnected || _phoneSource.dialling) && _viewManager.currentView !== "PHONE.Call"
    implicitWidth: row.implicitWidth + 2 * Theme.gap
    implicitHeight: Theme.touchTarget
    radius: height / 2
    label: qsTr("Show the call")
    onClicked: _viewManager.requestView("PHONE.Call")

    Rectangle {
        anchors { fill: parent; topMargin: Theme.px(8); bottomMargin: Theme.px(8) }
        radius: height / 2
        color: Theme.positive
    }

    Row {
        id: row

        anchors.centerIn: parent
        spacing: Theme.gap / 2
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
        LayoutMirroring.enabled: false // mirrored by its layout direction

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            name: "call"
            size: Theme.px(26)
            color: Theme.signalText
        }

        Label {
            objectName: "callChip"
            anchors.verticalCenter: parent.verticalCenter
            content: _phoneSource.callConnected ? Format.duration(_phoneSource.callDuration) : qsTr("Dialling…")
            color: Theme.signalText
            font.weight: Font.DemiBold
        }
    }
}
