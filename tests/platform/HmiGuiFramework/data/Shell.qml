// SPDX-License-Identifier: MIT
import QtQuick 2.15

Item {
    property Item viewArea: views
    property Item popupArea: popups

    Item {
        id: views

        objectName: "views"
        width: parent.width
        height: parent.height - 50
    }

    Item {
        id: popups

        objectName: "popups"
        anchors.fill: parent
    }
}
