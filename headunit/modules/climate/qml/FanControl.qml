// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// How much air: a bar for each step, and a key at each end.
Item {
    id: root

    implicitHeight: Theme.px(84)

    IconButton {
        id: less

        objectName: "fanLess"
        anchors { left: parent.left; verticalCenter: parent.verticalCenter }
        width: Theme.px(72)
        height: width
        icon: "minus"
        label: qsTr("Less air")
        fill: Theme.surfaceHigh
        onClicked: _climate.fan = _climate.fan - 1
    }

    Row {
        id: bars

        readonly property real barWidth: (width - (_climate.highestFan - 1) * spacing) / _climate.highestFan

        anchors { left: less.right; right: more.left; leftMargin: Theme.gap; rightMargin: Theme.gap; bottom: parent.bottom; top: parent.top }
        spacing: Theme.px(6)

        Repeater {
            model: _climate.highestFan

            Rectangle {
                objectName: "fanBar" + (index + 1)
                anchors.bottom: parent.bottom
                width: bars.barWidth
                height: bars.height * (0.3 + 0.7 * (index + 1) / _climate.highestFan)
                radius: Theme.px(6)
                color: _climate.on && index < _climate.fan ? Theme.accent : Theme.outline
            }
        }
    }

    IconButton {
        id: more

        objectName: "fanMore"
        anchors { right: parent.right; verticalCenter: parent.verticalCenter }
        width: Theme.px(72)
        height: width
        icon: "plus"
        label: qsTr("More air")
        fill: Theme.surfaceHigh
        onClicked: _climate.fan = _climate.fan + 1
    }
}
