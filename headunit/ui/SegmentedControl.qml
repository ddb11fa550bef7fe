// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// A choice of one out of a few. \a options is a list of texts.
Rectangle {
    id: root

    property var options: []
    property int current: 0

    signal chosen(int index)

    implicitHeight: Theme.touchTarget
    implicitWidth: options.length * Theme.px(128)
    radius: height / 2
    color: Theme.surfaceHigh

    Row {
        anchors.fill: parent
        layoutDirection: Theme.mirrored ? Qt.RightToLeft : Qt.LeftToRight

        Repeater {
            model: root.options

            Tappable {
                width: root.width / root.options.length
                height: root.height
                radius: height / 2
                label: modelData
                fill: index === root.current ? Theme.accent : "transparent"
                onClicked: root.chosen(index)

                Label {
                    anchors.fill: parent
                    anchors.margins: Theme.gap / 2
                    content: modelData
                    horizontalAlignment: Text.AlignHCenter
                    color: index === root.current ? Theme.accentText : Theme.text
                    font.weight: Font.DemiBold
                }
            }
        }
    }
}
