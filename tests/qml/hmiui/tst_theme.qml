// SPDX-License-Identifier: MIT
import QtQuick 2.15
import QtTest 1.15
import HmiUi 1.0

TestCase {
    name: "Theme"

    function test_coloursFollowThePalette() {
        _themeManager.palette = "day";
        const day = Theme.surface.toString();
        _themeManager.palette = "night";
        verify(Theme.surface.toString() !== day);
        _themeManager.palette = "day";
        compare(Theme.surface.toString(), day);
    }

    function test_sizesFollowTheWindow() {
        _hmiWindow.width = 1280;
        _hmiWindow.height = 720;
        compare(Theme.scale, 1);
        compare(Theme.touchTarget, 60);
        _hmiWindow.width = 800;
        _hmiWindow.height = 480;
        compare(Theme.scale, 0.625);
        compare(Theme.px(10), 6);
        _hmiWindow.width = 1280;
        _hmiWindow.height = 720;
    }

    function test_nothingMovesWithoutAnimations() {
        compare(Theme.durationShort, 0);
        AppSettings.animations = true;
        verify(Theme.durationShort > 0);
        AppSettings.animations = false;
    }
}
