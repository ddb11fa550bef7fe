// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiIntents 1.0
import HmiUi 1.0

/// Finds contacts and stations by their names.
Screen {
    id: root

    readonly property HmiIntentMonitor calling: HmiIntents.intentMonitor(HmiIntents.MakePhoneCall)

    title: qsTr("Search")
    onVisibleChanged: if (!visible) field.text = ""

    TextField {
        id: field

        objectName: "searchField"
        anchors { left: parent.left; right: parent.right; top: parent.top; leftMargin: Theme.margin; rightMargin: Theme.margin }
        icon: "search"
        hint: qsTr("Contacts and stations")
        onTextChanged: _searchModel.query = text
    }

    Card {
        id: card

        anchors {
            left: parent.left; right: parent.right; top: field.bottom; bottom: parent.bottom
            leftMargin: Theme.margin; rightMargin: Theme.margin; topMargin: Theme.gap
            bottomMargin: Math.max(Theme.margin, _inputPanel.open ? _inputPanel.height + Theme.gap / 2 : 0)
        }
    }

    EmptyNote {
        anchors.centerIn: card
        visible: results.count === 0 && card.height > Theme.rowHeight
        width: card.width - 2 * Theme.margin
        icon: "search"
        text: field.text.length > 0 ? qsTr("Nothing is called that") : qsTr("Type a name, or write it by hand")
    }

    ScrollList {
        id: results

        objectName: "searchResults"
        anchors { fill: card; margins: Theme.gap / 2 }
        model: _searchModel

        delegate: ListRow {
            objectName: "result" + index
            width: results.width
            icon: model.icon
            title: model.name
            subtitle: model.detail
            active: model.station || root.calling.enabled
            dimmed: !active
            onClicked: _searchModel.use(index)
        }
    }
}
