// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The places that one can drive to, by their kind, the nearest first.
Screen {
    id: root

    title: qsTr("Destinations")

    Card {
        id: kindsCard

        anchors { left: parent.left; top: parent.top; bottom: parent.bottom; leftMargin: Theme.margin; bottomMargin: Theme.margin }
        width: Theme.px(380)

        ScrollList {
            id: kinds

            objectName: "placeKinds"
            anchors { fill: parent; margins: Theme.gap }
            model: _navigation.destinations.categories

            delegate: ListRow {
                objectName: "placeKind" + index
                width: kinds.width
                icon: modelData.icon
                title: modelData.name
                selected: _navigation.destinations.category === index
                onClicked: _navigation.destinations.category = index
            }
        }
    }

    Card {
        anchors {
            left: kindsCard.right; right: parent.right; top: parent.top; bottom: parent.bottom
            leftMargin: Theme.gap; rightMargin: Theme.margin; bottomMargin: Theme.margin
        }

        ScrollList {
            id: places

            objectName: "places"
            anchors { fill: parent; margins: Theme.gap }
            model: _navigation.destinations

            delegate: ListRow {
                objectName: "place" + index
                width: places.width
                icon: model.icon
                title: model.name
                subtitle: model.kind
                value: model.distance
                onClicked: {
                    if (_navigation.navigateTo(model.placeRow))
                        _viewManager.requestView("NAVIGATION.Main");
                }
            }
        }
    }
}
