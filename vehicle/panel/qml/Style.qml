// SPDX-License-Identifier: MIT
pragma Singleton
import QtQuick 2.15

/// Colours and sizes of the panel, which looks the same by day and night.
QtObject {
    readonly property color room: "#0f1318"
    readonly property color plate: "#1a2028"
    readonly property color plateEdge: "#2c3642"
    readonly property color key: "#28323d"
    readonly property color keyHeld: "#3a4856"
    readonly property color text: "#e8eef4"
    readonly property color textMuted: "#93a3b3"
    readonly property color accent: "#4fd1c5"
    readonly property color accentText: "#04201f"
    readonly property int gap: 8
    readonly property int radius: 8
    readonly property int keyWidth: 84
    readonly property int keyHeight: 50
    readonly property int fontSize: 13
    readonly property int smallFontSize: 11
    readonly property string mono: "DejaVu Sans Mono"
}
