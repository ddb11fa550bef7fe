// SPDX-License-Identifier: MIT
import QtQuick 2.15
import QtTest 1.15
import HmiUi 1.0

Item {
    id: root

    width: 800
    height: 600

    Component { id: toggleComponent; Toggle {} }
    Component { id: sliderComponent; Slider { width: 300; from: 10; to: 40 } }
    Component { id: buttonComponent; PushButton { text: "Press" } }
    Component { id: segmentsComponent; SegmentedControl { width: 400; options: ["A", "B", "C", "D"] } }
    Component { id: rowComponent; ListRow { width: 500; title: "Title" } }
    Component { id: labelComponent; Label {} }
    Component { id: spyComponent; SignalSpy {} }

    TestCase {
        name: "Controls"
        when: windowShown

        function cleanup() {
            AppSettings.rightToLeft = false;
        }

        function made(component, properties) {
            const item = createTemporaryObject(component, root, properties || {});
            verify(item);
            return item;
        }

        function spyOn(target, signalName) {
            return createTemporaryObject(spyComponent, root, { target: target, signalName: signalName });
        }

        function test_aToggleAsksForAChangeAndLeavesItToItsOwner() {
            const toggle = made(toggleComponent);
            const spy = spyOn(toggle, "toggled");
            mouseClick(toggle);
            compare(spy.count, 1);
            compare(spy.signalArguments[0][0], true);
            compare(toggle.on, false);
            toggle.on = true;
            mouseClick(toggle);
            compare(spy.signalArguments[1][0], false);
        }

        function test_anInactiveToggleDoesNothing() {
            const toggle = made(toggleComponent, { active: false });
            const spy = spyOn(toggle, "toggled");
            mouseClick(toggle);
            compare(spy.count, 0);
        }

        function test_aSliderAsksForTheValueUnderTheFinger_data() {
            return [
                { tag: "start", x: 0, rtl: false, value: 10 },
                { tag: "middle", x: 150, rtl: false, value: 25 },
                { tag: "end", x: 299, rtl: false, value: 40 },
                { tag: "start, right to left", x: 0, rtl: true, value: 40 },
                { tag: "end, right to left", x: 299, rtl: true, value: 10 }
            ];
        }

        function test_aSliderAsksForTheValueUnderTheFinger(data) {
            AppSettings.rightToLeft = data.rtl;
            const slider = made(sliderComponent, { value: 17 });
            const spy = spyOn(slider, "moved");
            mousePress(slider, data.x, slider.height / 2);
            mouseRelease(slider, data.x, slider.height / 2);
            compare(spy.count, 1);
            compare(spy.signalArguments[0][0], data.value);
            compare(slider.value, 17);
        }

        function test_aValueOutsideItsRangeIsShownAtTheEnd() {
            const slider = made(sliderComponent, { value: 1000 });
            compare(slider.ratio, 1);
            slider.value = -5;
            compare(slider.ratio, 0);
        }

        function test_aButtonIsClickedOnlyWhileActive() {
            const button = made(buttonComponent);
            const spy = spyOn(button, "clicked");
            mouseClick(button);
            compare(spy.count, 1);
            button.active = false;
            mouseClick(button);
            compare(spy.count, 1);
        }

        function test_aSegmentIsChosenByItsPlace_data() {
            return [
                { tag: "left to right", rtl: false, index: 3 },
                { tag: "right to left", rtl: true, index: 0 }
            ];
        }

        function test_aSegmentIsChosenByItsPlace(data) {
            AppSettings.rightToLeft = data.rtl;
            const segments = made(segmentsComponent);
            waitForRendering(segments);
            const spy = spyOn(segments, "chosen");
            mouseClick(segments, 390, segments.height / 2);
            compare(spy.count, 1);
            compare(spy.signalArguments[0][0], data.index);
            compare(segments.current, 0);
        }

        function test_everythingToTouchIsLargeEnough_data() {
            return [
                { tag: "toggle", component: toggleComponent },
                { tag: "slider", component: sliderComponent },
                { tag: "button", component: buttonComponent },
                { tag: "segments", component: segmentsComponent },
                { tag: "row", component: rowComponent }
            ];
        }

        function test_everythingToTouchIsLargeEnough(data) {
            const item = made(data.component);
            verify(item.height >= 51, item.height);
            verify(item.width >= 51, item.width);
        }

        function test_aLabelShowsOutsideTextPlainlyAndBounded() {
            const label = made(labelComponent, { content: "<img width=2147483647 src='x'>" });
            compare(label.textFormat, Text.PlainText);
            compare(label.text, "<img width=2147483647 src='x'>");
            label.content = "x".repeat(100000);
            compare(label.text.length, 1000);
        }

        function test_rowsAreMirrored() {
            const row = made(rowComponent, { leadsOn: true, icon: "home" });
            const iconAtStart = row.children[2].x < row.width / 2;
            AppSettings.rightToLeft = true;
            waitForRendering(row);
            verify(iconAtStart !== (row.children[2].x < row.width / 2));
        }
    }
}
