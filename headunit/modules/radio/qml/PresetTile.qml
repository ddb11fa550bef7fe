// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// One preset: a press recalls it, a long press stores the station in it.
Item {
    id: root

    property int number: 0
    property var preset: ({})
    property bool current: false
    property bool focused: false // the knob is at it
    property bool recalled: false // a key far from the screen has just chosen it

    signal clicked()
    signal held()

    implicitHeight: Theme.px(124)

    Accessible.role: Accessible.Button
    Accessible.name: qsTr("Preset %1").arg(number)

    Rectangle {
        anchors.fill: parent
        radius: Theme.radius
        color: area.pressed ? Theme.surfacePressed : root.current ? Theme.accent : Theme.surface

        Behavior on color {
            ColorAnimation { duration: Theme.durationShort; easing.type: Theme.easing }
        }
    }

    Rectangle {
        objectName: "recalledRing"
        anchors { fill: parent; margins: -Theme.px(6) }
        visible: root.recalled
        radius: Theme.radius + Theme.px(6)
        color: "transparent"
        border.width: Theme.px(4)
        border.color: Theme.accent
    }

    Column {
        anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter; margins: Theme.gap / 2 }
        spacing: Theme.px(4)

        Label {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            content: root.number
            font.pixelSize: Theme.textCaption
            color: root.current ? Theme.accentText : Theme.textMuted
        }

        Label {
            width: parent.width
            horizontalAlignment: Text.AlignHCenter
            wrapMode: Text.Wrap
            maximumLineCount: 2
            content: root.preset.name ? root.preset.name : root.preset.frequency ? root.preset.frequency : "–"
            color: root.current ? Theme.accentText : Theme.text
            font.weight: Font.DemiBold
            font.pixelSize: Theme.px(22)
        }
    }

    FocusRing {
        shown: root.focused
    }

    MouseArea {
        id: area

        objectName: "touchArea"
        anchors.fill: parent
        onClicked: root.clicked()
        onPressAndHold: root.held()
    }
}
