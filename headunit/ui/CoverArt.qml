// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// Stands in for a cover: rings in the product's colours around the icon of the source.
Rectangle {
    id: root

    property string icon
    property bool lit: true // it plays

    radius: Theme.radius
    color: Theme.accentSoft

    Behavior on color {
        ColorAnimation { duration: Theme.durationLong; easing.type: Theme.easing }
    }

    Repeater {
        model: 4

        Rectangle {
            anchors.centerIn: parent
            width: root.width * (0.92 - index * 0.15)
            height: width
            radius: width / 2
            color: "transparent"
            border.width: Math.max(1, Theme.px(2))
            border.color: Theme.accent
            opacity: 0.12 + index * 0.1
        }
    }

    Rectangle {
        anchors.centerIn: parent
        width: root.width * 0.36
        height: width
        radius: width / 2
        color: root.lit ? Theme.accent : Theme.surface

        Icon {
            anchors.centerIn: parent
            name: root.icon
            size: parent.width * 0.5
            color: root.lit ? Theme.accentText : Theme.accent
        }
    }
}
