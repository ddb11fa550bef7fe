// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Day and night.
Screen {
    id: root

    title: qsTr("Display")

    Card {
        anchors { left: parent.left; right: parent.right; top: parent.top; leftMargin: Theme.margin; rightMargin: Theme.margin }
        height: column.implicitHeight + 2 * Theme.gap

        Column {
            id: column

            anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.gap }

            Repeater {
                model: [
                    { text: qsTr("Automatic"), detail: qsTr("As the light outside asks for"), icon: "display" },
                    { text: qsTr("Day"), detail: qsTr("Always bright"), icon: "sun" },
                    { text: qsTr("Night"), detail: qsTr("Always dark"), icon: "moon" }
                ]

                ListRow {
                    objectName: "palette" + index
                    icon: modelData.icon
                    title: modelData.text
                    subtitle: modelData.detail
                    selected: _paletteControl.mode === index
                    onClicked: _paletteControl.mode = index

                    Icon {
                        anchors.verticalCenter: parent.verticalCenter
                        visible: _paletteControl.mode === index
                        name: "check"
                        color: Theme.accent
                    }
                }
            }
        }
    }
}
