// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The frame around the views: rail, status bar, and the layers for views, notices and popups.
Rectangle {
    id: root

    property Item viewArea: views
    property Item popupArea: popups

    color: Theme.background
    LayoutMirroring.enabled: Theme.mirrored
    LayoutMirroring.childrenInherit: true

    Behavior on color {
        ColorAnimation { duration: Theme.durationLong }
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
    }

    Loader {
        anchors { horizontalCenter: views.horizontalCenter; bottom: views.bottom; bottomMargin: Theme.margin }
        source: _statusBarController.transientUrl
    }

    Item {
        id: popups

        anchors.fill: parent
    }
}
