// SPDX-License-Identifier: MIT
pragma Singleton
import QtQuick 2.15

/// The one place that QML takes colours, sizes, type and durations from. Sizes are reference pixels of a 1280 × 720 screen,
/// scaled to the window.
QtObject {
    readonly property QtObject colors: _themeManager.colors
    readonly property QtObject values: _themeManager.values

    readonly property color background: colors.background
    readonly property color surface: colors.surface
    readonly property color surfaceHigh: colors.surfaceHigh
    readonly property color surfacePressed: colors.surfacePressed
    readonly property color outline: colors.outline
    readonly property color text: colors.text
    readonly property color textMuted: colors.textMuted
    readonly property color accent: colors.accent
    readonly property color accentText: colors.accentText
    readonly property color accentSoft: colors.accentSoft
    readonly property color positive: colors.positive
    readonly property color negative: colors.negative
    readonly property color signalText: colors.signalText
    readonly property color scrim: colors.scrim

    readonly property real scale: Math.min(_hmiWindow.width / values.referenceWidth, _hmiWindow.height / values.referenceHeight)
    readonly property bool mirrored: AppSettings.rightToLeft

    readonly property real gap: px(values.gap)
    readonly property real margin: px(values.margin)
    readonly property real radius: px(values.radius)
    readonly property real touchTarget: px(values.touchTarget)
    readonly property real statusBarHeight: px(values.statusBarHeight)
    readonly property real railWidth: px(values.railWidth)
    readonly property real rowHeight: px(values.rowHeight)
    readonly property real iconSize: px(values.iconSize)

    readonly property real textCaption: px(values.textCaption)
    readonly property real textBody: px(values.textBody)
    readonly property real textTitle: px(values.textTitle)
    readonly property real textDisplay: px(values.textDisplay)

    readonly property int durationShort: AppSettings.animations ? values.durationShort : 0
    readonly property int durationLong: AppSettings.animations ? values.durationLong : 0

    /// Reference pixels in pixels of this window, whole.
    function px(referencePixels) {
        return Math.round(referencePixels * scale);
    }
}
