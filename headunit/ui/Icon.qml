// SPDX-License-Identifier: MIT
import QtQuick 2.15

/// An icon of the product, by name or by the URL that a module gives for it, drawn in a colour.
Image {
    property string name
    property url base: name.length > 0 ? "image://hmiimages/" + name : ""
    property color color: Theme.text
    property real size: Theme.iconSize
    property bool mirrorsWithLayout: false

    width: size
    height: size
    sourceSize.width: size
    sourceSize.height: size
    source: String(base).length > 0 ? base + "?color=" + encodeURIComponent(color.toString()) : ""
    mirror: mirrorsWithLayout && Theme.mirrored
}
