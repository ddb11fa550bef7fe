// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// All messages, the newest first.
Screen {
    id: root

    title: qsTr("Messages")

    Card {
        id: card

        anchors { fill: parent; leftMargin: Theme.margin; rightMargin: Theme.margin; bottomMargin: Theme.margin }
    }

    EmptyNote {
        anchors { left: card.left; right: card.right; verticalCenter: card.verticalCenter }
        visible: list.count === 0
        icon: "messages"
        text: qsTr("No messages")
        detail: qsTr("Texts, missed calls and notices of the vehicle come here.")
    }

    ScrollList {
        id: list

        objectName: "messages"
        anchors { fill: card; margins: Theme.gap }
        model: _messages.model

        delegate: ListRow {
            objectName: "message" + index
            width: list.width
            icon: model.icon
            title: model.sender
            subtitle: model.text
            value: _market.clock(model.time)
            leadsOn: true
            onClicked: {
                if (_messages.open(index))
                    _viewManager.requestView("MESSAGES.Detail");
            }

            Rectangle {
                objectName: "unreadMark"
                anchors.verticalCenter: parent.verticalCenter
                width: Theme.px(16)
                height: width
                radius: width / 2
                visible: model.unread
                color: Theme.accent
            }
        }
    }
}
