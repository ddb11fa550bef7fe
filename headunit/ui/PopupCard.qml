// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// Frame of a popup: dims the view and shows a card in the middle. A press beside the card is taken and ignored.
Item {
    id: root

    property var popupData
    property string title
    property string icon
    property color iconColor: Theme.accent
    default property alias content: column.data

    LayoutMirroring.enabled: Theme.mirrored
    LayoutMirroring.childrenInherit: true

    Rectangle {
        anchors.fill: parent
        color: Theme.scrim
    }

    MouseArea {
        anchors.fill: parent
    }

    Card {
        anchors.centerIn: parent
        width: Math.min(parent.width - 2 * Theme.margin, Theme.px(680))
        height: column.implicitHeight + 2 * Theme.margin
        border.width: 1
        border.color: Theme.outline

        Column {
            id: column

            anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter; margins: Theme.margin }
            spacing: Theme.gap

            Row {
                anchors { left: parent.left; right: parent.right }
                spacing: Theme.gap

                Icon {
                    visible: root.icon.length > 0
                    name: root.icon
                    color: root.iconColor
                    size: Theme.px(40)
                }

                Label {
                    width: parent.width - Theme.px(40) - Theme.gap
                    content: root.title
                    font.pixelSize: Theme.textTitle
                    font.weight: Font.DemiBold
                }
            }
        }
    }
}
