// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiIntents 1.0
import HmiUi 1.0

/// One message, and what can be done with it.
Screen {
    id: root

    readonly property HmiIntentMonitor calling: HmiIntents.intentMonitor(HmiIntents.MakePhoneCall)

    title: qsTr("Message")

    EmptyNote {
        anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter }
        visible: !_messages.isOpen
        icon: "messages"
        text: qsTr("No message is open")
    }

    Card {
        id: card

        anchors { left: parent.left; top: parent.top; bottom: parent.bottom; right: actions.left; leftMargin: Theme.margin; rightMargin: Theme.gap; bottomMargin: Theme.margin }
        visible: _messages.isOpen

        Icon {
            id: mark

            anchors { left: parent.left; top: parent.top; margins: Theme.margin }
            name: _messages.icon
            size: Theme.px(48)
            color: Theme.accent
        }

        Label {
            id: sender

            objectName: "messageSender"
            anchors { left: mark.right; right: time.left; verticalCenter: mark.verticalCenter; leftMargin: Theme.gap; rightMargin: Theme.gap }
            content: _messages.sender
            font.pixelSize: Theme.textTitle
            font.weight: Font.DemiBold
        }

        Label {
            id: time

            anchors { right: parent.right; verticalCenter: mark.verticalCenter; rightMargin: Theme.margin }
            content: _market.clock(_messages.time)
            color: Theme.textMuted
        }

        Flickable {
            anchors { left: parent.left; right: parent.right; top: mark.bottom; bottom: answer.top; margins: Theme.margin }
            contentHeight: text.height
            clip: true
            boundsBehavior: Flickable.StopAtBounds

            Label {
                id: text

                objectName: "messageText"
                width: parent.width
                wrapMode: Text.Wrap
                maximumLineCount: 40
                content: _messages.text
                font.pixelSize: Theme.px(28)
            }
        }

        Label {
            id: answer

            objectName: "messageAnswer"
            anchors { left: parent.left; right: parent.right; bottom: parent.bottom; margins: Theme.margin }
            wrapMode: Text.Wrap
            maximumLineCount: 2
            content: _messages.answer.length > 0 ? qsTr("Answered: %1").arg(_messages.answer) : ""
            color: Theme.accent
        }
    }

    Card {
        id: actions

        anchors { right: parent.right; top: parent.top; bottom: parent.bottom; rightMargin: Theme.margin; bottomMargin: Theme.margin }
        width: Theme.px(500)
        visible: _messages.isOpen

        Flickable {
            anchors { fill: parent; margins: Theme.gap }
            contentHeight: column.height
            clip: true
            boundsBehavior: Flickable.StopAtBounds

            Column {
                id: column

                width: parent.width

                ListRow {
                    objectName: "messageCall"
                    visible: _messages.number.length > 0
                    icon: "phone"
                    title: qsTr("Call back")
                    subtitle: _messages.number
                    active: root.calling && root.calling.enabled
                    dimmed: !active
                    onClicked: HmiIntents.requestAction(HmiIntents.MakePhoneCall, [_messages.number])
                }

                ListRow {
                    objectName: "messageNavigate"
                    visible: _messages.place.length > 0
                    icon: "navigation"
                    title: qsTr("Drive there")
                    subtitle: _messages.place
                    onClicked: HmiIntents.requestAction(HmiIntents.Navigate, [_messages.place])
                }

                Repeater {
                    model: _messages.answerable ? _messages.answers : []

                    ListRow {
                        objectName: "answer" + index
                        icon: "message"
                        title: modelData
                        onClicked: _messages.sendAnswer(index)
                    }
                }

                ListRow {
                    objectName: "messageRemove"
                    icon: "trash"
                    title: qsTr("Delete")
                    onClicked: {
                        _messages.removeCurrent();
                        _viewManager.requestView("MESSAGES.Main");
                    }
                }
            }
        }
    }
}
