// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// A value on a line. It shows \a value and asks for a change; whoever owns the value changes it.
Item {
    id: root

    property int from: 0
    property int to: 100
    property int value: 0
    property string label
    property bool mirrored: Theme.mirrored
    property bool focused: false // the knob is at it

    signal moved(int value)

    /// Moves by so many twentieths of the range, at least by one: what a press of the knob lets it do.
    function adjust(steps) {
        const step = Math.max(1, Math.round((to - from) / 20));
        const wanted = Math.max(from, Math.min(to, value + steps * step));
        if (wanted !== value)
            moved(wanted);
    }

    implicitHeight: Theme.touchTarget
    implicitWidth: Theme.px(320)

    Accessible.role: Accessible.Slider
    Accessible.name: label

    readonly property real ratio: to > from ? Math.max(0, Math.min(1, (value - from) / (to - from))) : 0

    Rectangle {
        id: track

        anchors.verticalCenter: parent.verticalCenter
        width: parent.width
        height: Theme.px(10)
        radius: height / 2
        color: Theme.outline

        Rectangle {
            x: root.mirrored ? parent.width - width : 0
            width: parent.width * root.ratio
            height: parent.height
            radius: parent.radius
            color: Theme.accent
        }
    }

    Rectangle {
        readonly property real place: root.mirrored ? 1 - root.ratio : root.ratio

        anchors.verticalCenter: parent.verticalCenter
        x: (root.width - width) * place
        width: Theme.px(34)
        height: width
        radius: width / 2
        color: Theme.accent
        border.width: Theme.px(4)
        border.color: Theme.surface
    }

    FocusRing {
        shown: root.focused
        around: Theme.radius
    }

    MouseArea {
        objectName: "touchArea"
        anchors.fill: parent
        preventStealing: true

        function ask(x) {
            const ratio = Math.max(0, Math.min(1, x / width));
            const value = Math.round(root.from + (root.mirrored ? 1 - ratio : ratio) * (root.to - root.from));
            if (value !== root.value)
                root.moved(value);
        }

        onPressed: function (mouse) { ask(mouse.x); }
        onPositionChanged: function (mouse) { ask(mouse.x); }
    }
}
