// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Keyboard and writing pad at the lower edge; the view above stays in sight and in use.
Item {
    id: root

    property var popupData
    readonly property bool leavesViewInUse: true // also with the knob

    LayoutMirroring.enabled: Theme.mirrored
    LayoutMirroring.childrenInherit: true

    Rectangle {
        id: sheet

        objectName: "inputPanel"
        anchors { left: parent.left; right: parent.right; bottom: parent.bottom }
        height: content.height + Theme.gap
        color: Theme.surface
        border.width: 1
        border.color: Theme.outline
        onHeightChanged: _inputPanel.height = height
        Component.onCompleted: _inputPanel.height = height

        MouseArea {
            anchors.fill: parent // what lies beneath is not touched between two keys
        }

        Column {
            id: content

            anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.gap / 2 }
            spacing: Theme.gap / 2

            CandidateBar {
                width: parent.width
            }

            Loader {
                objectName: "inputMethod"
                width: parent.width
                height: Theme.px(5 * 54 + 4 * 8)
                source: _inputPanel.writing ? "WritingPad.qml" : "Keys.qml"
            }
        }
    }
}
