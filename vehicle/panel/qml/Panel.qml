// SPDX-License-Identifier: MIT
import QtQuick 2.15
import QtQuick.Window 2.15
import "."

Window {
    id: root

    readonly property int margin: 16

    visible: true
    width: 1240
    height: 780
    minimumWidth: 1240
    minimumHeight: 760
    title: qsTr("Vehicle")
    color: Style.room
    onActiveChanged: if (!active) controls.releaseAll()

    Rectangle { // pictures of the content have no window behind them
        anchors.fill: parent
        color: Style.room
    }

    FrontPanel {
        id: front
        x: root.margin
        y: root.margin
    }

    SteeringWheel {
        id: wheel
        x: root.margin
        y: front.y + front.height + root.margin
        height: root.height - y - root.margin
        width: height
    }

    Item {
        id: happenings
        anchors.left: wheel.right
        anchors.leftMargin: root.margin
        anchors.right: front.right
        anchors.top: wheel.top
        anchors.bottom: wheel.bottom

        Flow {
            id: actions
            width: parent.width
            spacing: 6

            Repeater {
                model: controls.actions

                TextButton {
                    required property string modelData
                    required property int index
                    objectName: "action" + index
                    text: modelData
                    onClicked: controls.trigger(index)
                }
            }
        }

        Row {
            id: journalBar
            anchors.top: actions.bottom
            anchors.topMargin: 12
            width: parent.width
            spacing: 6

            Text {
                width: parent.width - why.width - clear.width - 12
                height: 28
                verticalAlignment: Text.AlignVCenter
                text: qsTr("Keys sent and calls received")
                elide: Text.ElideRight
                color: Style.accent
                font.pixelSize: Style.fontSize
                font.bold: true
            }

            TextButton {
                id: why
                objectName: "decisions"
                text: qsTr("Why?")
                checked: controls.decisionsWanted
                onClicked: controls.decisionsWanted = !controls.decisionsWanted
            }

            TextButton {
                id: clear
                text: qsTr("Clear")
                onClicked: controls.journal.clear()
            }
        }

        Rectangle {
            anchors.top: journalBar.bottom
            anchors.topMargin: 6
            anchors.bottom: parent.bottom
            width: parent.width
            radius: Style.radius
            color: Style.plate
            border.color: Style.plateEdge

            JournalList {
                anchors.fill: parent
                anchors.margins: 8
            }
        }
    }

    Rectangle {
        anchors.left: front.right
        anchors.leftMargin: root.margin
        anchors.right: parent.right
        anchors.rightMargin: root.margin
        anchors.top: front.top
        anchors.bottom: wheel.bottom
        radius: Style.radius
        color: Style.plate
        border.color: Style.plateEdge

        StateList {
            anchors.fill: parent
            anchors.leftMargin: 12
            anchors.rightMargin: 8
            anchors.bottomMargin: 8
        }
    }
}
