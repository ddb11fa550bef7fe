// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// Volume and mute, for whichever module asks for the page.
Screen {
    title: qsTr("Sound")

    Card {
        anchors { left: parent.left; right: parent.right; top: parent.top; leftMargin: Theme.margin; rightMargin: Theme.margin }
        height: column.implicitHeight + 2 * Theme.gap

        Column {
            id: column

            anchors { left: parent.left; right: parent.right; top: parent.top; margins: Theme.gap }

            ListRow {
                icon: "volume"
                title: qsTr("Volume")
                value: _globalSource.volume
                active: false

                Slider {
                    objectName: "volumeSlider"
                    width: Theme.px(460)
                    to: 40
                    value: _globalSource.volume
                    label: qsTr("Volume")
                    onMoved: function (value) { _globalSource.setVolume(value); }
                }
            }

            ListRow {
                icon: "mute"
                title: qsTr("Mute")
                onClicked: _globalSource.setMuted(!_globalSource.muted)

                Toggle {
                    objectName: "muteToggle"
                    label: qsTr("Mute")
                    on: _globalSource.muted
                    onToggled: function (on) { _globalSource.setMuted(on); }
                }
            }
        }
    }
}
