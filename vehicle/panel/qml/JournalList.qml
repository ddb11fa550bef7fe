// SPDX-License-Identifier: MIT
import QtQuick 2.15
import "."

/// What went on, newest at the bottom; it follows unless one has scrolled away from there.
ListView {
    id: root

    readonly property var marks: ["\u25b6", "\u25c0", "?"]
    readonly property var colours: [Style.text, Style.accent, "#ffb454"]
    property bool follows: true

    objectName: "journal"
    clip: true
    model: controls.journal
    boundsBehavior: Flickable.StopAtBounds
    onMovementEnded: follows = atYEnd
    onCountChanged: if (follows) Qt.callLater(positionViewAtEnd) // qmllint disable type

    delegate: Row {
        id: entry

        required property string time
        required property int kind
        required property string text

        width: root.width
        spacing: 8

        Text {
            width: 62
            horizontalAlignment: Text.AlignRight
            text: entry.time
            color: Style.textMuted
            font.family: Style.mono
            font.pixelSize: Style.smallFontSize
        }

        Text {
            width: 12
            text: root.marks[entry.kind]
            color: root.colours[entry.kind]
            font.family: Style.mono
            font.pixelSize: Style.smallFontSize
        }

        Text {
            width: entry.width - 90
            text: entry.text
            textFormat: Text.PlainText
            wrapMode: Text.Wrap
            color: root.colours[entry.kind]
            font.family: Style.mono
            font.pixelSize: Style.smallFontSize
        }
    }
}
