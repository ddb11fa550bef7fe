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
    Component { id: badgeComponent; Badge { text: "HD" } }
    Component { id: progressComponent; ProgressBar { width: 200 } }
    Component { id: noteComponent; EmptyNote { width: 400; text: "Nothing" } }
    Component { id: sheetComponent; BottomSheet { width: 800; height: 600; PushButton { width: 200; text: "Stop" } } }
    Component { id: popupComponent; PopupCard { width: 800; height: 600; title: "Title" } }
    Component { id: signalBarsComponent; SignalBars {} }
    Component { id: viewComponent; Item { width: 800; height: 600; LayoutMirroring.childrenInherit: true } }
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
            const icon = Array.from(row.children).find(child => child.name === "home");
            const iconAtStart = icon.x < row.width / 2;
            AppSettings.rightToLeft = true;
            waitForRendering(row);
            verify(iconAtStart !== (icon.x < row.width / 2));
        }

        function test_aBadgeIsHollowWhileItsThingIsMissing() {
            const badge = made(badgeComponent);
            compare(badge.border.width, 0);
            verify(badge.color.a > 0);
            badge.lit = false;
            compare(badge.border.width, 1);
            compare(badge.color.a, 0);
        }

        function test_aProgressBarStaysWithinItsRange_data() {
            return [
                { tag: "begin", value: 0, to: 10, ratio: 0 },
                { tag: "half", value: 5, to: 10, ratio: 0.5 },
                { tag: "too much", value: 50, to: 10, ratio: 1 },
                { tag: "too little", value: -5, to: 10, ratio: 0 },
                { tag: "nothing to do", value: 5, to: 0, ratio: 0 }
            ];
        }

        function test_aProgressBarStaysWithinItsRange(data) {
            const bar = made(progressComponent, { value: data.value, to: data.to });
            compare(bar.ratio, data.ratio);
            compare(bar.children[0].width, 200 * data.ratio);
        }

        function test_aProgressBarFillsFromWhereReadingBegins() {
            const bar = made(progressComponent, { value: 1, to: 4 });
            compare(bar.children[0].x, 0);
            AppSettings.rightToLeft = true;
            compare(bar.children[0].x, 150);
        }

        function test_rowsAreMirroredOnce_data() {
            return [{ tag: "alone", inherited: false }, { tag: "in a mirrored view", inherited: true }];
        }

        function test_rowsAreMirroredOnce(data) {
            AppSettings.rightToLeft = true;
            const view = made(viewComponent);
            view.LayoutMirroring.enabled = data.inherited;
            const segments = createTemporaryObject(segmentsComponent, view);
            const first = findText(segments, "A");
            const last = findText(segments, "D");
            tryVerify(function () { return first.mapToItem(view, 0, 0).x > last.mapToItem(view, 0, 0).x; });
        }

        function test_aLabelBeginsWhereReadingBegins() {
            const row = made(rowComponent, { title: "Title" });
            const title = findText(row, "Title");
            verify(title);
            compare(title.effectiveHorizontalAlignment, Text.AlignLeft);
            AppSettings.rightToLeft = true;
            compare(title.effectiveHorizontalAlignment, Text.AlignRight);
        }

        /// The item beneath \a item that shows this text.
        function findText(item, text) {
            if (item.text === text)
                return item;
            for (let i = 0; i < item.children.length; ++i) {
                const found = findText(item.children[i], text);
                if (found)
                    return found;
            }
            return null;
        }

        function test_anEmptyNoteShowsWhatItHas() {
            const note = made(noteComponent);
            tryVerify(function () { return note.implicitHeight > 0; });
            const bare = note.implicitHeight;
            note.detail = "Why there is nothing";
            tryVerify(function () { return note.implicitHeight > bare; });
        }

        function test_aSheetTakesPressesOnItsCardAndLeavesTheRest() {
            const beneath = made(buttonComponent, { width: 800, height: 600 });
            const spy = spyOn(beneath, "clicked");
            const sheet = made(sheetComponent);
            mouseClick(sheet, 400, 20);
            compare(spy.count, 1);
            mouseClick(sheet, 400, sheet.sheet.y + 5);
            compare(spy.count, 1);
        }

        function test_aPopupIsDismissedBesideItsCardWhenItMayBe_data() {
            return [
                { tag: "beside", dismissible: true, x: 10, y: 10, count: 1 },
                { tag: "on the card", dismissible: true, x: 400, y: 300, count: 0 },
                { tag: "not dismissible", dismissible: false, x: 10, y: 10, count: 0 }
            ];
        }

        function test_aPopupIsDismissedBesideItsCardWhenItMayBe(data) {
            const beneath = made(buttonComponent, { width: 800, height: 600 });
            const under = spyOn(beneath, "clicked");
            const popup = made(popupComponent, { dismissible: data.dismissible });
            const spy = spyOn(popup, "dismissed");
            mouseClick(popup, data.x, data.y);
            compare(spy.count, data.count);
            compare(under.count, 0);
            const key = findChild(popup, "dismissPopup");
            compare(key.visible, data.dismissible);
            if (data.dismissible) {
                mouseClick(key);
                compare(spy.count, data.count + 1);
            }
        }

        function test_signalBarsAreLitUpToTheLevel() {
            const bars = made(signalBarsComponent, { level: 3 });
            const lit = [];
            for (let i = 0; i < 5; ++i)
                lit.push(Qt.colorEqual(bars.children[i].color, Theme.text));
            compare(lit, [true, true, true, false, false]);
        }

        function test_durations_data() {
            return [
                { tag: "nothing", seconds: 0, text: "0:00" },
                { tag: "minute", seconds: 60, text: "1:00" },
                { tag: "almost an hour", seconds: 3599, text: "59:59" },
                { tag: "hours", seconds: 36061, text: "10:01:01" }
            ];
        }

        function test_durations(data) {
            compare(Format.duration(data.seconds), data.text);
        }
    }
}
