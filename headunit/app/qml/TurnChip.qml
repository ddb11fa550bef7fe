// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiIntents 1.0
import HmiUi 1.0

/// The next turn while another screen than the map is shown, and the way back to it.
Tappable {
    id: root

    visible: _turnHint.shown
    implicitWidth: row.implicitWidth + 2 * Theme.gap
    implicitHeight: Theme.touchTarget
    radius: height / 2
    label: qsTr("Show the map")
    onClicked: HmiIntents.requestAction(HmiIntents.ShowNavigationMenu)

    Rectangle {
        anchors { fill: parent; topMargin: Theme.px(8); bottomMargin: Theme.px(8) }
        radius: height / 2
        color: Theme.accent
    }

    Row {
        id: row

        anchors.centerIn: parent
        spacing: Theme.gap / 2
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
        LayoutMirroring.enabled: false // mirrored by its layout direction

        Icon {
            anchors.verticalCenter: parent.verticalCenter
            name: _turnHint.icon
            size: Theme.px(30)
            color: Theme.accentText
        }

        Label {
            objectName: "turnChip"
            anchors.verticalCenter: parent.verticalCenter
            content: _turnHint.distance
            color: Theme.accentText
            font.weight: Font.DemiBold
        }
    }
}
