// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// A choice of one out of a few. \a options is a list of texts.
Rectangle {
    id: root

    property var options: []
    property int current: 0

    signal chosen(int index)

    implicitHeight: Theme.touchTarget
    implicitWidth: segments.width
    radius: height / 2
    color: Theme.surfaceHigh

    Row {
        id: segments

        height: parent.height
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight
        LayoutMirroring.enabled: false // mirrored by its layout direction

        Repeater {
            model: root.options

            Tappable {
                width: Math.max(Theme.px(128), text.implicitWidth + 2 * Theme.gap)
                height: root.height
                radius: height / 2
                label: modelData
                fill: index === root.current ? Theme.accent : "transparent"
                onClicked: root.chosen(index)

                Label {
                    id: text

                    anchors.centerIn: parent
                    content: modelData
                    color: index === root.current ? Theme.accentText : Theme.text
                    font.weight: Font.DemiBold
                }
            }
        }
    }
}
