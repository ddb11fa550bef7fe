// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The menu of all pages, those of other modules among them.
Screen {
    title: qsTr("Settings")

    Card {
        anchors { fill: parent; leftMargin: Theme.margin; rightMargin: Theme.margin; bottomMargin: Theme.margin }

        ScrollList {
            id: list

            objectName: "settingsPages"
            anchors { fill: parent; margins: Theme.gap }
            model: _settingsPages

            delegate: ListRow {
                objectName: "page" + index
                width: list.width
                icon: model.icon
                title: model.text
                active: model.actionEnabled
                dimmed: !model.actionEnabled
                leadsOn: true
                onClicked: _settingsPages.trigger(index)
            }
        }
    }
}
