// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// One side of the car: its temperature and its seat.
Card {
    id: root

    property string name // objectNames of the keys begin with it
    property string title
    property string temperature
    property int seat

    signal stepped(int steps)
    signal seatPressed()

    opacity: _climate.on ? 1 : 0.5

    Label {
        id: heading

        anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.margin }
        horizontalAlignment: Text.AlignHCenter
        content: root.title
        color: Theme.textMuted
    }

    Column {
        anchors { left: parent.left; right: parent.right; top: heading.bottom; bottom: seatKey.top; topMargin: Theme.gap; bottomMargin: Theme.gap }

        IconButton {
            objectName: root.name + "Warmer"
            anchors.horizontalCenter: parent.horizontalCenter
            width: Theme.px(120)
            height: Theme.px(72)
            icon: "plus"
            label: qsTr("Warmer")
            fill: Theme.surfaceHigh
            onClicked: root.stepped(1)
        }

        Item {
            width: parent.width
            height: parent.height - 2 * Theme.px(72)

            Row {
                anchors.centerIn: parent
                spacing: Theme.px(4)
                LayoutMirroring.enabled: false // a number and its unit stand in one order everywhere

                Label {
                    id: number

                    objectName: root.name + "Temperature"
                    content: root.temperature
                    font.pixelSize: Theme.px(72)
                    font.weight: Font.Light
                }

                Label {
                    anchors { top: number.top; topMargin: Theme.px(14) }
                    content: _climate.unit
                    color: Theme.textMuted
                }
            }
        }

        IconButton {
            objectName: root.name + "Cooler"
            anchors.horizontalCenter: parent.horizontalCenter
            width: Theme.px(120)
            height: Theme.px(72)
            icon: "minus"
            label: qsTr("Cooler")
            fill: Theme.surfaceHigh
            onClicked: root.stepped(-1)
        }
    }

    Tappable {
        id: seatKey

        objectName: root.name + "Seat"
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.margin }
        height: Theme.px(84)
        label: qsTr("Seat heating")
        fill: root.seat > 0 ? Theme.accentSoft : Theme.surfaceHigh
        onClicked: root.seatPressed()

        Row {
            anchors.centerIn: parent
            spacing: Theme.gap

            Icon {
                anchors.verticalCenter: parent.verticalCenter
                name: "seat-heat"
                size: Theme.px(44)
                color: root.seat > 0 ? Theme.accent : Theme.text
            }

            Repeater {
                model: 3

                Rectangle {
                    anchors.verticalCenter: parent.verticalCenter
                    width: Theme.px(14)
                    height: width
                    radius: width / 2
                    color: index < root.seat ? Theme.accent : Theme.outline
                }
            }
        }
    }
}
