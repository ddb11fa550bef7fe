// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// Something to press: shows the press, and tells of a click. Give it a size of at least Theme.touchTarget.
Item {
    id: root

    property bool active: true
    property bool focused: false // the knob is at it
    property real radius: Theme.radius
    property color fill: "transparent"
    property color pressedFill: Theme.surfacePressed
    property string label // what a test or a screen reader calls it
    readonly property alias pressed: area.pressed

    signal clicked()

    Accessible.role: Accessible.Button
    Accessible.name: label
    Accessible.onPressAction: if (active) clicked()

    Rectangle {
        anchors.fill: parent
        radius: root.radius
        color: area.pressed ? root.pressedFill : root.fill

        Behavior on color {
            ColorAnimation { duration: Theme.durationShort; easing.type: Theme.easing }
        }
    }

    FocusRing {
        shown: root.focused
        around: root.radius
    }

    MouseArea {
        id: area

        objectName: "touchArea"
        anchors.fill: parent
        enabled: root.active
        onClicked: root.clicked()
    }
}
