// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// What to do next, and how far it is to the destination.
Card {
    id: root

    border.width: 1
    border.color: Theme.outline

    Rectangle {
        id: turn

        anchors { left: parent.left; right: parent.right; top: parent.top }
        height: turnColumn.implicitHeight + 2 * Theme.margin
        radius: Theme.radius
        color: Theme.accent

        Column {
            id: turnColumn

            anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter; margins: Theme.margin }
            spacing: Theme.gap / 2

            Row {
                width: parent.width
                spacing: Theme.gap

                Icon {
                    objectName: "turnIcon"
                    anchors.verticalCenter: parent.verticalCenter
                    name: _navigation.turnIcon
                    size: Theme.px(84)
                    color: Theme.accentText
                }

                Label {
                    objectName: "turnDistance"
                    anchors.verticalCenter: parent.verticalCenter
                    content: _navigation.turnDistance
                    color: Theme.accentText
                    font.pixelSize: Theme.px(48)
                    font.weight: Font.DemiBold
                }
            }

            Label {
                objectName: "turnText"
                width: parent.width
                content: _navigation.turnText
                color: Theme.accentText
            }

            Label {
                objectName: "turnStreet"
                width: parent.width
                content: _navigation.turnStreet
                color: Theme.accentText
                font.pixelSize: Theme.textTitle
                font.weight: Font.DemiBold
                wrapMode: Text.Wrap
                maximumLineCount: 2
            }
        }
    }

    Column {
        anchors { left: parent.left; right: parent.right; top: turn.bottom; margins: Theme.margin }
        spacing: Theme.gap / 2

        Label {
            objectName: "remaining"
            width: parent.width
            content: _navigation.remaining + " · " + _navigation.remainingTime
            font.pixelSize: Theme.textTitle
            font.weight: Font.DemiBold
        }

        Label {
            objectName: "arrival"
            width: parent.width
            visible: _navigation.arrival.length > 0
            content: qsTr("Arrival %1").arg(_market.clock(_navigation.arrival))
            color: Theme.textMuted
        }
    }

    Column {
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.margin }
        spacing: Theme.gap

        PushButton {
            objectName: "toggleDrive"
            width: parent.width
            icon: _navigation.driving ? "pause" : "play"
            text: _navigation.driving ? qsTr("Pause") : qsTr("Demonstration")
            onClicked: _navigation.setDriving(!_navigation.driving)
        }

        Row {
            width: parent.width
            spacing: Theme.gap

            IconButton {
                id: showRoute

                objectName: "showRoute"
                width: Theme.px(96)
                icon: "list"
                label: qsTr("Route")
                fill: Theme.surfaceHigh
                onClicked: _viewManager.requestView("NAVIGATION.Route")
            }

            PushButton {
                objectName: "stopGuidance"
                width: parent.width - showRoute.width - parent.spacing
                icon: "close"
                text: qsTr("End")
                onClicked: _navigation.stop()
            }
        }
    }
}
