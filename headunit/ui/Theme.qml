// SPDX-License-Identifier: MIT
pragma Singleton
import QtQuick 2.15

/// The one place that QML takes colours, sizes, type and durations from. Sizes are reference pixels of a 1280 × 720 screen,
/// scaled to the window.
QtObject {
    readonly property var colors: _themeManager.colors // what the theme's file names
    readonly property var values: _themeManager.values

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
    readonly property color focus: colors.focus
    readonly property color positive: colors.positive
    readonly property color negative: colors.negative
    readonly property color signalText: colors.signalText
    readonly property color scrim: colors.scrim
    readonly property color dark: colors.dark // in every palette
    readonly property color lightOnDark: colors.lightOnDark
    readonly property color mutedOnDark: colors.mutedOnDark

    readonly property color mapLand: colors.mapLand
    readonly property color mapBuilt: colors.mapBuilt
    readonly property color mapPark: colors.mapPark
    readonly property color mapWater: colors.mapWater
    readonly property color mapStreet: colors.mapStreet
    readonly property color mapMainStreet: colors.mapMainStreet
    readonly property color mapMotorway: colors.mapMotorway
    readonly property color mapRoadEdge: colors.mapRoadEdge
    readonly property color mapRoute: colors.mapRoute
    readonly property color mapRouteEdge: colors.mapRouteEdge
    readonly property color mapName: colors.mapName
    readonly property color mapNameEdge: colors.mapNameEdge
    readonly property color mapParkName: colors.mapParkName
    readonly property color mapMark: colors.mapMark
    readonly property color mapMarkEdge: colors.mapMarkEdge

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
    readonly property int durationAmbient: AppSettings.animations ? values.durationAmbient : 0 // of what goes on by itself
    readonly property int easing: Easing.OutCubic // of what answers a touch or a change
    readonly property int easingAmbient: Easing.InOutSine
    readonly property int durationLong: AppSettings.animations ? values.durationLong : 0

    /// Reference pixels in pixels of this window, whole.
    function px(referencePixels) {
        return Math.round(referencePixels * scale);
    }
}
