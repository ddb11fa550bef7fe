// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// Text. Never interprets markup, and shows at most a thousand characters of what comes from outside.
Text {
    property string content

    text: content.length > 1000 ? content.substring(0, 1000) : content
    textFormat: Text.PlainText
    elide: Text.ElideRight
    maximumLineCount: 1
    color: Theme.text
    font.pixelSize: Theme.textBody
    horizontalAlignment: Text.AlignLeft // mirrored with the layout, whatever direction the text has
    verticalAlignment: Text.AlignVCenter
}
