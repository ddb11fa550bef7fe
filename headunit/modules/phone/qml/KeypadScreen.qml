// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiIntents 1.0
import HmiUi 1.0

/// Dialling a number by hand.
Screen {
    id: root

    property string number
    readonly property HmiIntentMonitor calling: HmiIntents.intentMonitor(HmiIntents.MakePhoneCall)

    title: qsTr("Keypad")

    EmergencyNote {
        id: emergency

        anchors { left: parent.left; right: parent.right; top: parent.top; leftMargin: Theme.margin; rightMargin: Theme.margin }
    }

    Label {
        id: display

        objectName: "dialledNumber"
        anchors { left: parent.left; right: parent.right; top: emergency.bottom; leftMargin: Theme.margin; rightMargin: Theme.margin }
        height: Theme.px(84)
        horizontalAlignment: Text.AlignHCenter
        elide: Text.ElideLeft // the end is what was just typed
        content: root.number.length > 0 ? root.number : qsTr("Enter a number")
        color: root.number.length > 0 ? Theme.text : Theme.textMuted
        font.pixelSize: Theme.px(44)
    }

    Grid {
        id: keys

        readonly property real keyHeight: (height - 3 * spacing) / 4

        anchors { horizontalCenter: parent.horizontalCenter; top: display.bottom; bottom: actions.top; topMargin: Theme.gap / 2; bottomMargin: Theme.gap }
        width: Theme.px(640)
        columns: 3
        spacing: Theme.gap * 0.75
        LayoutMirroring.enabled: false // a keypad has its digits in one order everywhere

        Repeater {
            model: ["1", "2", "3", "4", "5", "6", "7", "8", "9", "*", "0", "#"]

            Tappable {
                objectName: "key" + modelData
                width: (keys.width - 2 * keys.spacing) / 3
                height: keys.keyHeight
                fill: Theme.surface
                label: modelData
                onClicked: if (root.number.length < 32) root.number += modelData

                Label {
                    anchors.centerIn: parent
                    content: modelData
                    font.pixelSize: Theme.textTitle
                    font.weight: Font.DemiBold
                }
            }
        }
    }

    Row {
        id: actions

        anchors { horizontalCenter: parent.horizontalCenter; bottom: parent.bottom; bottomMargin: Theme.margin }
        spacing: Theme.gap

        PushButton {
            objectName: "dial"
            width: Theme.px(420)
            icon: "phone"
            text: qsTr("Call")
            color: Theme.positive
            textColor: Theme.signalText
            active: root.number.length > 0 && root.calling.enabled
            onClicked: HmiIntents.requestAction(HmiIntents.MakePhoneCall, [root.number])
        }

        IconButton {
            objectName: "backspace"
            width: Theme.px(96)
            icon: "backspace"
            label: qsTr("Delete the last digit")
            mirrorsWithLayout: true
            fill: Theme.surface
            active: root.number.length > 0
            onClicked: root.number = root.number.slice(0, -1)
        }
    }
}
