// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// One row of a list: icon, title, a second line, and something at the end.
Tappable {
    id: root

    property string icon
    property string title
    property string subtitle
    property string value
    property bool selected: false
    property bool dimmed: false
    property bool leadsOn: false // shows a chevron
    default property alias trailing: trailingSlot.data

    implicitHeight: Theme.rowHeight
    width: parent ? parent.width : implicitWidth
    radius: Theme.radius / 2
    fill: selected ? Theme.accentSoft : "transparent"
    label: title
    LayoutMirroring.enabled: Theme.mirrored
    LayoutMirroring.childrenInherit: true

    Icon {
        id: iconItem

        anchors { left: parent.left; leftMargin: Theme.gap; verticalCenter: parent.verticalCenter }
        visible: root.icon.length > 0
        opacity: root.dimmed ? 0.4 : 1
        name: root.icon
        color: root.selected ? Theme.accent : Theme.textMuted
    }

    Column {
        anchors {
            left: root.icon.length > 0 ? iconItem.right : parent.left
            leftMargin: Theme.gap
            right: valueLabel.left
            rightMargin: Theme.gap
            verticalCenter: parent.verticalCenter
        }

        Label {
            width: parent.width
            content: root.title
            color: root.selected ? Theme.accent : Theme.text
            opacity: root.dimmed ? 0.4 : 1
        }

        Label {
            width: parent.width
            visible: root.subtitle.length > 0
            content: root.subtitle
            opacity: root.dimmed ? 0.4 : 1
            color: Theme.textMuted
            font.pixelSize: Theme.textCaption
        }
    }

    Label {
        id: valueLabel

        anchors { right: trailingSlot.left; rightMargin: content.length > 0 ? Theme.gap : 0; verticalCenter: parent.verticalCenter }
        width: Math.min(implicitWidth, root.width * 0.4)
        content: root.value
        color: Theme.textMuted
    }

    Row {
        id: trailingSlot

        anchors { right: chevron.left; verticalCenter: parent.verticalCenter }
    }

    Icon {
        id: chevron

        anchors { right: parent.right; rightMargin: Theme.gap; verticalCenter: parent.verticalCenter }
        width: root.leadsOn ? size : 0
        visible: root.leadsOn
        name: "chevron"
        size: Theme.px(24)
        color: Theme.textMuted
        mirrorsWithLayout: true
    }
}
