// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The frame around the views: rail, status bar, and the layers for views, popups and notices.
Rectangle {
    id: root

    property Item viewArea: views
    property Item popupArea: popups
    property Item statusArea: statusBar
    property Item railArea: rail

    color: Theme.background
    LayoutMirroring.enabled: Theme.mirrored
    LayoutMirroring.childrenInherit: true

    Behavior on color {
        ColorAnimation { duration: Theme.durationLong; easing.type: Theme.easing }
    }

    Rail {
        id: rail

        anchors { left: parent.left; top: parent.top; bottom: parent.bottom }
    }

    StatusBar {
        id: statusBar

        anchors { left: rail.right; right: parent.right; top: parent.top }
    }

    Item {
        id: views

        anchors { left: rail.right; right: parent.right; top: statusBar.bottom; bottom: parent.bottom }
        clip: true
        Component.onCompleted: _inputPanel.viewLayer = views
        transform: Translate {
            y: -_inputPanel.lift // a text field is not hidden by the keyboard

            Behavior on y {
                NumberAnimation { duration: Theme.durationShort; easing.type: Theme.easing }
            }
        }
    }

    Item {
        id: popups

        anchors.fill: parent
    }

    // Above popups, so that the volume is seen with every one of them; a dark screen stays dark.
    Loader {
        objectName: "transient"
        anchors { horizontalCenter: views.horizontalCenter; top: views.top }
        visible: !_systemScreens.dark
        source: _statusBarController.transientUrl
    }
}
