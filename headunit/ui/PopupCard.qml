// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// Frame of a popup: dims the view and shows a card in the middle. A press beside the card is taken; it dismisses what is
/// \a dismissible, which has a key for that as well.
Item {
    id: root

    property var popupData
    property string title
    property string icon
    property color iconColor: Theme.accent
    property bool wide: false
    property bool dismissible: false
    default property alias content: column.data

    signal dismissed()

    LayoutMirroring.enabled: Theme.mirrored
    LayoutMirroring.childrenInherit: true

    Rectangle {
        anchors.fill: parent
        color: Theme.scrim
    }

    MouseArea {
        anchors.fill: parent
        onClicked: if (root.dismissible) root.dismissed()
    }

    Card {
        anchors.centerIn: parent
        width: Math.min(parent.width - 2 * Theme.margin, Theme.px(root.wide ? 900 : 680))
        height: column.implicitHeight + 2 * Theme.margin
        border.width: 1
        border.color: Theme.outline

        MouseArea {
            anchors.fill: parent // a press on the card is no press beside it
        }

        Column {
            id: column

            anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter; margins: Theme.margin }
            spacing: Theme.gap

            Row {
                anchors { left: parent.left; right: parent.right }
                spacing: Theme.gap

                Icon {
                    id: mark

                    anchors.verticalCenter: parent.verticalCenter
                    visible: root.icon.length > 0
                    name: root.icon
                    color: root.iconColor
                    size: Theme.px(40)
                }

                Label {
                    anchors.verticalCenter: parent.verticalCenter
                    width: parent.width - (mark.visible ? mark.width + parent.spacing : 0) - (closeKey.visible ? closeKey.width + parent.spacing : 0)
                    content: root.title
                    font.pixelSize: Theme.textTitle
                    font.weight: Font.DemiBold
                }

                IconButton {
                    id: closeKey

                    objectName: "dismissPopup"
                    visible: root.dismissible
                    icon: "close"
                    label: qsTr("Close")
                    onClicked: root.dismissed()
                }
            }
        }
    }
}
