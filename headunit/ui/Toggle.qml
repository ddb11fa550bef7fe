// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// A switch. It shows \a on and asks for a change; whoever owns the value changes it.
Item {
    id: root

    property bool on: false
    property bool active: true
    property bool focused: false // the knob is at it
    property string label

    signal toggled(bool on)

    /// As a touch does.
    function activate() { toggled(!on); }

    implicitWidth: Theme.px(88)
    implicitHeight: Theme.touchTarget
    opacity: active ? 1 : 0.4

    Accessible.role: Accessible.CheckBox
    Accessible.name: label
    Accessible.checked: on

    Rectangle {
        id: track

        anchors.verticalCenter: parent.verticalCenter
        width: parent.width
        height: Theme.px(44)
        radius: height / 2
        color: root.on ? Theme.accent : Theme.outline

        Rectangle {
            readonly property bool atEnd: root.on !== Theme.mirrored

            y: Theme.px(4)
            x: atEnd ? track.width - width - Theme.px(4) : Theme.px(4)
            width: track.height - Theme.px(8)
            height: width
            radius: height / 2
            color: Theme.surface

            Behavior on x {
                NumberAnimation { duration: Theme.durationShort; easing.type: Theme.easing }
            }
        }
    }

    FocusRing {
        shown: root.focused
        around: track.radius
    }

    MouseArea {
        objectName: "touchArea"
        anchors.fill: parent
        enabled: root.active
        onClicked: root.toggled(!root.on)
    }
}
