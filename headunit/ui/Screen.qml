// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// Base of every view: fills the view area, has a title for the status bar, and mirrors for right-to-left.
Item {
    id: root

    property string title
    property var viewData

    LayoutMirroring.enabled: Theme.mirrored
    LayoutMirroring.childrenInherit: true

    // Takes presses that nothing on the view wants, so that they do not reach a view beneath during a transition.
    MouseArea {
        anchors.fill: parent
    }

    Rectangle {
        anchors.fill: parent
        color: Theme.background

        Behavior on color {
            ColorAnimation { duration: Theme.durationLong; easing.type: Theme.easing }
        }
    }
}
