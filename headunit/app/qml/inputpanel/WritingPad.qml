// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HeadUnit.Input 1.0
import HmiUi 1.0

/// The area to write in, and the keys that one needs besides.
Item {
    id: root

    Rectangle {
        id: pad

        anchors { left: parent.left; right: keys.left; rightMargin: Theme.gap / 2; top: parent.top; bottom: parent.bottom }
        radius: Theme.radius / 2
        color: Theme.surfaceHigh
        border.width: 1
        border.color: Theme.outline
        onWidthChanged: _inputPanel.setPadSize(width, height)
        onHeightChanged: _inputPanel.setPadSize(width, height)

        Repeater {
            model: _inputPanel.boxes

            Item {
                x: index * width
                width: pad.width / _inputPanel.boxes
                height: pad.height

                Rectangle {
                    width: 1
                    height: parent.height
                    visible: index > 0
                    color: Theme.outline
                }

                Rectangle {
                    anchors { left: parent.left; right: parent.right; margins: Theme.margin }
                    y: Math.round(parent.height * 0.78)
                    height: 1
                    color: Theme.outline
                }
            }
        }

        Label {
            x: Math.round((pad.width / _inputPanel.boxes - width) / 2)
            anchors.verticalCenter: parent.verticalCenter
            visible: !area.wrote
            content: qsTr("Write here")
            color: Theme.textMuted
        }

        Ink {
            id: ink

            objectName: "ink"
            anchors.fill: parent
            color: area.rested ? Theme.textMuted : Theme.accent
            thickness: Theme.px(7)
        }

        MouseArea {
            id: area

            property bool wrote: false
            property bool rested: false

            objectName: "writingArea"
            anchors.fill: parent
            preventStealing: true
            onPressed: function (mouse) {
                rested = false;
                _inputPanel.beginStroke(mouse.x);
                wrote = true;
                ink.begin(mouse.x, mouse.y);
            }
            onPositionChanged: function (mouse) { ink.extend(mouse.x, mouse.y); }
            onReleased: _inputPanel.addStroke(ink.end())
            onCanceled: _inputPanel.addStroke(ink.end())
        }
    }

    Grid {
        id: keys

        anchors { right: parent.right; top: parent.top; bottom: parent.bottom }
        columns: 2
        spacing: Theme.px(8)
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
        LayoutMirroring.enabled: false // mirrored by its layout direction

        Repeater {
            model: _inputPanel.padKeys

            Key {
                objectName: modelData.action.length > 0 ? "key_" + modelData.action : "padKey" + index
                width: Theme.px(120)
                height: Math.floor((keys.height - 3 * keys.spacing) / 4)
                key: modelData
            }
        }
    }

    Connections {
        target: _inputPanel

        function onPadCleared() {
            ink.clear();
            area.rested = false;
            area.wrote = false;
        }

        function onHandRested() { area.rested = true; }
    }
}
