// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Where to go: all places, or those of a kind.
Card {
    id: root

    border.width: 1
    border.color: Theme.outline

    Column {
        id: head

        anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.margin }
        spacing: Theme.gap

        Label {
            width: parent.width
            content: _navigation.townName
            font.pixelSize: Theme.textTitle
            font.weight: Font.DemiBold
        }

        PushButton {
            objectName: "chooseDestination"
            width: parent.width
            icon: "search"
            text: qsTr("Where to?")
            primary: true
            onClicked: {
                _navigation.destinations.category = 0;
                _viewManager.requestView("NAVIGATION.Destinations");
            }
        }
    }

    ScrollList {
        id: list

        objectName: "quickCategories"
        anchors { left: parent.left; right: parent.right; top: head.bottom; bottom: parent.bottom; margins: Theme.gap }
        model: _navigation.destinations.categories

        delegate: ListRow {
            objectName: "quickCategory" + index
            width: list.width
            height: index === 0 ? 0 : implicitHeight
            visible: index > 0 // all places have the key above
            icon: modelData.icon
            title: modelData.name
            leadsOn: true
            onClicked: {
                _navigation.destinations.category = index;
                _viewManager.requestView("NAVIGATION.Destinations");
            }
        }
    }
}
