// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

Tappable {
    id: root

    property url iconUrl
    property string name
    property bool isHome: false

    fill: Theme.surface
    label: name

    Rectangle {
        id: badge

        anchors { left: parent.left; top: parent.top; margins: Theme.margin }
        width: Theme.px(84)
        height: width
        radius: Theme.radius
        color: root.isHome ? Theme.accent : Theme.accentSoft

        Icon {
            anchors.centerIn: parent
            base: root.iconUrl
            size: Theme.px(46)
            color: root.isHome ? Theme.accentText : Theme.accent
        }
    }

    Label {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.margin }
        content: root.name
        font.pixelSize: Theme.textTitle
        font.weight: Font.DemiBold
        opacity: root.active ? 1 : 0.4
    }
}
