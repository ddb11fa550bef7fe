// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// A line of text to be typed or written. \a hint is shown as long as it is empty; once it has the focus, the input
/// panel comes.
Tappable {
    id: root

    property alias text: input.text
    property alias maximumLength: input.maximumLength
    property alias inputMethodHints: input.inputMethodHints
    property string icon
    property string hint
    readonly property bool editing: input.activeFocus

    signal accepted()

    implicitHeight: Theme.touchTarget
    radius: height / 2
    fill: Theme.surfaceHigh
    pressedFill: Theme.surfaceHigh
    label: hint
    active: !_drivingLock.locked
    LayoutMirroring.enabled: Theme.mirrored
    LayoutMirroring.childrenInherit: true
    onClicked: edit()

    function edit() { input.forceActiveFocus(); }

    Rectangle {
        anchors.fill: parent
        radius: root.radius
        color: "transparent"
        border.width: root.editing ? 2 : 1
        border.color: root.editing ? Theme.accent : Theme.outline
    }

    Icon {
        id: mark

        anchors { left: parent.left; leftMargin: Theme.gap; verticalCenter: parent.verticalCenter }
        visible: root.icon.length > 0
        name: root.icon
        size: Theme.px(28)
        color: Theme.textMuted
    }

    TextInput {
        id: input

        objectName: "textInput"
        anchors {
            left: mark.visible ? mark.right : parent.left; leftMargin: Theme.gap
            right: clearKey.left; rightMargin: Theme.gap / 2
            verticalCenter: parent.verticalCenter
        }
        clip: true
        maximumLength: 200
        enabled: root.active
        color: Theme.text
        selectionColor: Theme.accent
        selectedTextColor: Theme.accentText
        font.pixelSize: Theme.textBody
        onAccepted: root.accepted()
    }

    Label {
        anchors { left: input.left; right: input.right; verticalCenter: parent.verticalCenter }
        visible: input.text.length === 0 && input.preeditText.length === 0
        content: root.active ? root.hint : qsTr("Not while driving")
        color: Theme.textMuted
    }

    IconButton {
        id: clearKey

        objectName: "clearText"
        anchors { right: parent.right; verticalCenter: parent.verticalCenter }
        visible: input.text.length > 0
        icon: "close"
        iconSize: Theme.px(24)
        label: qsTr("Clear")
        onClicked: {
            input.clear();
            root.edit();
        }
    }
}
