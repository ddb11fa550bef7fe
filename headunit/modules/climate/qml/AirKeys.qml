// SPDX-License-Identifier: MIT
import QtQuick 2.15
import HmiClimate 1.0
import HmiUi 1.0

/// Where the air goes; several directions at once are possible.
Row {
    id: root

    spacing: Theme.gap

    Repeater {
        model: [
            { name: "airWindscreen", direction: Climate.Windscreen, icon: "air-windscreen", text: qsTr("Windscreen") },
            { name: "airFace", direction: Climate.Face, icon: "air-face", text: qsTr("Face") },
            { name: "airFeet", direction: Climate.Feet, icon: "air-feet", text: qsTr("Feet") }
        ]

        ClimateKey {
            objectName: modelData.name
            width: (root.width - 2 * root.spacing) / 3
            height: root.height
            icon: modelData.icon
            text: modelData.text
            on: _climate.on && (_climate.air & modelData.direction) !== 0
            onClicked: _climate.toggleAir(modelData.direction)
        }
    }
}
