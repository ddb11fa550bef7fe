// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// All manoeuvres that lie ahead.
Screen {
    id: root

    title: qsTr("Route")

    Card {
        id: card

        anchors { fill: parent; leftMargin: Theme.margin; rightMargin: Theme.margin; bottomMargin: Theme.margin }
    }

    EmptyNote {
        anchors { left: card.left; right: card.right; verticalCenter: card.verticalCenter }
        visible: !_navigation.active
        icon: "navigation"
        text: qsTr("No destination")
    }

    Label {
        id: way

        objectName: "routeWay"
        anchors { right: card.right; top: card.top; margins: Theme.margin }
        visible: _navigation.active
        content: _navigation.remaining + " · " + _navigation.remainingTime
        color: Theme.accent
        font.pixelSize: Theme.textTitle
        font.weight: Font.DemiBold
    }

    Label {
        id: summary

        objectName: "routeDestination"
        anchors { left: card.left; right: way.left; top: card.top; margins: Theme.margin }
        visible: _navigation.active
        content: _navigation.destination
        font.pixelSize: Theme.textTitle
        font.weight: Font.DemiBold
    }

    ScrollList {
        id: list

        objectName: "routeSteps"
        anchors { left: card.left; right: card.right; top: summary.bottom; bottom: card.bottom; margins: Theme.gap }
        model: _navigation.steps

        delegate: ListRow {
            objectName: "step" + index
            width: list.width
            icon: model.icon
            title: model.street.length > 0 ? model.street : model.instruction
            subtitle: model.street.length > 0 ? model.instruction : ""
            value: model.distance
            selected: index === 0
            active: false
        }
    }
}
