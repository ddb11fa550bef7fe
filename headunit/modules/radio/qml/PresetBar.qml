// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiUi 1.0

/// The presets of the bank, and the key that changes the bank.
Row {
    id: root

    property var tuner
    property int recalled: 0 // place of the preset that the steering wheel has just recalled, 0 for none
    property bool following: false // the steering wheel has asked for a preset
    readonly property int activePreset: tuner.activePreset
    readonly property int firstNumber: 6 * tuner.activePresetBank + 1
    readonly property real tileWidth: (width - bank.width - 6 * spacing) / 6

    spacing: Theme.gap * 0.75
    layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
    LayoutMirroring.enabled: false // mirrored by its layout direction

    /// The steering wheel has asked for another preset: the one that comes is marked for a moment.
    function followWheel() {
        following = true;
        mark.restart();
    }

    onActivePresetChanged: {
        if (!following || activePreset < firstNumber || activePreset >= firstNumber + 6)
            return;
        recalled = activePreset - firstNumber + 1;
        mark.restart();
    }

    Timer {
        id: mark

        interval: 2000
        onTriggered: {
            root.following = false;
            root.recalled = 0;
        }
    }

    Tappable {
        id: bank

        objectName: "presetBank"
        width: Theme.px(92)
        height: parent.height
        fill: Theme.surfaceHigh
        label: qsTr("Bank %1").arg(root.tuner.activePresetBank + 1)
        onClicked: _radio.selectNextBank()

        Column {
            anchors { left: parent.left; right: parent.right; verticalCenter: parent.verticalCenter }
            spacing: Theme.px(6)

            Label {
                width: parent.width
                horizontalAlignment: Text.AlignHCenter
                content: qsTr("Bank")
                color: Theme.textMuted
                font.pixelSize: Theme.textCaption
            }

            Label {
                objectName: "bankNumber"
                width: parent.width
                horizontalAlignment: Text.AlignHCenter
                content: root.tuner.activePresetBank + 1
                font.pixelSize: Theme.textTitle
                font.weight: Font.DemiBold
            }

            Row {
                anchors.horizontalCenter: parent.horizontalCenter
                spacing: Theme.px(6)

                Repeater {
                    model: _radio.bankCount

                    Rectangle {
                        width: Theme.px(8)
                        height: width
                        radius: width / 2
                        color: index === root.tuner.activePresetBank ? Theme.accent : Theme.outline
                    }
                }
            }
        }
    }

    Repeater {
        model: 6

        PresetTile {
            objectName: "preset" + (index + 1)
            width: root.tileWidth
            height: root.height
            number: index + 1
            preset: root.presetAt(index)
            current: root.tuner.activePreset === root.firstNumber + index
            recalled: root.recalled === number
            onClicked: _radio.recallPreset(number)
            onHeld: _radio.storePreset(number)
        }
    }

    /// The preset in a place of the active bank, or an empty object.
    function presetAt(place) {
        const all = root.tuner.presets;
        for (let i = 0; i < all.length; ++i)
            if (all[i].bank === root.tuner.activePresetBank && all[i].index === place + 1)
                return all[i];
        return {};
    }
}
