// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// Frame of a popup at the lower edge that leaves the view above it in sight and in use.
Item {
    id: root

    property var popupData
    readonly property bool leavesViewInUse: true // also with the knob
    default property alias content: slot.data
    readonly property alias sheet: card
    readonly property alias spacing: slot.spacing // between the parts of the content

    LayoutMirroring.enabled: Theme.mirrored
    LayoutMirroring.childrenInherit: true

    Card {
        id: card

        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.gap }
        height: slot.implicitHeight + 2 * Theme.margin
        border.width: 1
        border.color: Theme.outline

        MouseArea {
            anchors.fill: parent // what lies beneath the card is not touched through it
        }

        Row {
            id: slot

            anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter; leftMargin: Theme.margin; rightMargin: Theme.margin }
            spacing: Theme.margin
        }
    }
}
