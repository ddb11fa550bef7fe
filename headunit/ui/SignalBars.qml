// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// Strength of a signal, 0 to 5.
Row {
    id: root

    property int level: 0

    spacing: Theme.px(3)
    LayoutMirroring.enabled: false

    Repeater {
        model: 5

        Rectangle {
            anchors.bottom: parent.bottom
            width: Theme.px(4)
            height: Theme.px(7 + index * 4)
            radius: width / 2
            color: index < root.level ? Theme.text : Theme.outline
        }
    }
}
