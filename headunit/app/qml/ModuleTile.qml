// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The way into a module.
Tappable {
    id: root

    property url iconUrl
    property string name
    property bool isHome: false
    property int mark: 0 // things that wait there

    fill: Theme.surface
    label: name

    Rectangle {
        id: badge

        anchors { left: parent.left; top: parent.top; margins: Theme.gap * 1.25 }
        width: Theme.px(72)
        height: width
        radius: Theme.radius
        color: root.isHome ? Theme.accent : Theme.accentSoft

        Icon {
            anchors.centerIn: parent
            base: root.iconUrl
            size: Theme.px(42)
            color: root.isHome ? Theme.accentText : Theme.accent
        }
    }

    Badge {
        objectName: "mark"
        anchors { right: parent.right; top: parent.top; margins: Theme.gap * 1.25 }
        visible: root.mark > 0
        text: root.mark
    }

    Label {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.gap * 1.25 }
        content: root.name
        font.pixelSize: Theme.px(26)
        font.weight: Font.DemiBold
        opacity: root.active ? 1 : 0.4
    }
}
