// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// One key. Held, it repeats if it is backspace, and offers further texts if it has some.
Tappable {
    id: root

    property var key
    readonly property bool types: key.action.length === 0
    readonly property bool acts: !types && key.action !== "space"
    readonly property string typed: types ? (_inputPanel.shift > 0 ? key.capital : key.text) : ""
    readonly property var more: types ? (_inputPanel.shift > 0 ? key.moreCapital : key.more) : []
    readonly property bool isShift: key.action === "shift"
    readonly property bool available: (key.action !== "layout" || _inputPanel.hasOtherLayouts)
                                      && (key.action !== "writing" || _inputPanel.canWrite)
    readonly property var names: ({
        shift: qsTr("Shift"), backspace: qsTr("Delete"), symbols: qsTr("Symbols"), letters: qsTr("Letters"),
        layout: qsTr("Next keyboard"), writing: qsTr("Write by hand"), keys: qsTr("Keyboard"), hide: qsTr("Hide keyboard"),
        enter: qsTr("Done"), space: qsTr("Space")
    })
    property bool held: false

    visible: available
    radius: Theme.radius / 2
    fill: isShift && _inputPanel.shift === 2 ? Theme.accentSoft : acts ? Theme.surfacePressed : Theme.surfaceHigh
    pressedFill: Theme.outline
    label: types ? typed : names[key.action]
    onPressedChanged: pressed ? hold() : letGo()
    onClicked: if (!held) perform()

    function perform() {
        if (types)
            _inputPanel.type(typed);
        else
            _inputPanel.press(key.action);
    }

    function hold() {
        held = false;
        holding.restart();
    }

    function letGo() {
        holding.stop();
        repeating.stop();
    }

    Rectangle {
        anchors.fill: parent
        radius: root.radius
        color: "transparent"
        border.width: 1
        border.color: Theme.outline
    }

    Icon {
        anchors.centerIn: parent
        visible: root.key.icon.length > 0
        name: root.key.icon
        size: Theme.px(30)
        color: root.isShift && _inputPanel.shift > 0 ? Theme.accent : Theme.text
        mirrorsWithLayout: root.key.action === "backspace" || root.key.action === "enter"
    }

    Label {
        anchors.centerIn: parent
        visible: root.key.icon.length === 0
        content: root.key.action === "symbols" ? "?123" : root.types ? root.typed : _inputPanel.lettersTitle
        color: root.key.action === "space" ? Theme.textMuted : Theme.text
        font.pixelSize: root.types ? Theme.px(28) : Theme.textCaption
    }

    Timer {
        id: holding

        interval: 450
        onTriggered: {
            root.held = root.key.action === "backspace" || root.more.length > 0;
            if (root.key.action === "backspace")
                repeating.start();
            else if (root.held)
                _inputPanel.offer(root.more);
        }
    }

    Timer {
        id: repeating

        interval: 70
        repeat: true
        triggeredOnStart: true
        onTriggered: root.perform()
    }
}
