// SPDX-License-Identifier: MIT
import QtQuick 2.15
import QtTest 1.15
import HmiCore 1.0
import HmiIntents 1.0
import HmiOverrides 1.0

/// Every type of the core as the author of a module's QML uses it. `fixture` plays the modules and the vehicle.
TestCase {
    id: test

    property string toldIntents
    property string toldKeys
    property string toldLanguages
    property int nameChanges: 0
    property string toldOverride

    name: "Types"

    HmiHandwriting {
        id: pad
    }

    HmiComplexKeyboard {
        id: keyboard
    }

    HmiLanguageBundleModel {
        id: languages
    }

    Text {
        id: written

        readonly property var candidates: pad.recognizer.candidates

        text: candidates.join(" ")
    }

    Text {
        id: typed

        text: keyboard.engine.currentInputString
    }

    Text {
        id: offered

        text: languages.count + " of " + languages.bundleId
    }

    Text {
        id: tile

        text: HmiOverrides.nameOverrides.length > 0 ? HmiOverrides.nameOverride(401) : "Phone"
    }

    Connections {
        target: HmiIntents

        function onHandled(intent) { test.toldIntents += " handled " + intent; }
        function onHandlingFailed(intent, error) { test.toldIntents += " failed " + intent + " " + error; }
        function onNoHandlerFound(intent) { test.toldIntents += " nobody for " + intent; }
    }

    Connections {
        target: HardKeyController

        function onSwcSeekUpShortPress() { test.toldKeys += " up"; }
        function onSwcSeekDownLongPress() { test.toldKeys += " down long"; }
    }

    Connections {
        target: HmiOverrides

        function onNameOverridesChanged() { ++test.nameChanges; }
    }

    Connections {
        target: fixture.phoneOverride
        ignoreUnknownSignals: false

        function onNameOverrideChanged(domain, active, overide) {
            test.toldOverride = domain + " " + active + " " + (overide === fixture.phoneOverride);
        }
    }

    Connections {
        target: HmiTranslationManager

        function onCurrentLanguageIdChanged(arg) { test.toldLanguages += " " + arg; }
    }

    function init() {
        toldIntents = "";
        toldKeys = "";
        toldLanguages = "";
        nameChanges = 0;
        toldOverride = "";
        fixture.beginCapture();
    }

    function cleanup() {
        compare(fixture.endCapture(), []);
    }

    /// What QML says to who creates the \a element of a \a module.
    function refusal(module, element) {
        try {
            Qt.createQmlObject("import " + module + " 1.0\n" + element + " {}", test, "refused").destroy();
        } catch (error) {
            return error.qmlErrors[0].message;
        }
        return "";
    }

    function test_uncreatableTypesSayWhy_data() {
        return [
            { tag: "HmiHandwritingRecognizer", module: "HmiCore" },
            { tag: "HmiComplexKeyboardEngine", module: "HmiCore" },
            { tag: "HmiIntentMonitor", module: "HmiIntents" }
        ];
    }

    function test_uncreatableTypesSayWhy(row) {
        compare(refusal(row.module, row.tag), row.tag + " is not creatable");
    }

    function test_singletonsAreNotCreated_data() {
        return [
            { tag: "HmiTranslationManager", module: "HmiCore" },
            { tag: "HmiRegionPropertyStore", module: "HmiCore" },
            { tag: "HmiMarketPropertyStore", module: "HmiCore" },
            { tag: "HmiValueMapper", module: "HmiCore" },
            { tag: "HardKeyController", module: "HmiCore" },
            { tag: "HmiLanguagePropertyStore", module: "HmiCore" },
            { tag: "HmiIntents", module: "HmiIntents" },
            { tag: "HmiOverrides", module: "HmiOverrides" }
        ];
    }

    function test_singletonsAreNotCreated(row) {
        verify(refusal(row.module, row.tag).length > 0);
    }

    function test_creatableTypesAreCreated_data() {
        return [{ tag: "HmiHandwriting" }, { tag: "HmiComplexKeyboard" }, { tag: "HmiLanguageBundleModel" }];
    }

    function test_creatableTypesAreCreated(row) {
        compare(refusal("HmiCore", row.tag), "");
    }

    function test_handwriting() {
        compare(HmiHandwriting.Invalid, 0);
        pad.language = HmiHandwriting.SimplifiedChinese;
        compare(pad.recognizer.maxCandidateCount, 10);
        pad.recognizer.maxCandidateCount = 3;
        pad.recognizer.strokes = [[Qt.point(0, 0), Qt.point(50, 50), Qt.point(99, 99)], [Qt.point(99, 0), Qt.point(0, 99)]];
        tryCompare(written, "text", "3 2");
        compare(pad.recognizer.candidateCount, 2);
    }

    function test_keyboard() {
        keyboard.language = HmiComplexKeyboard.TraditionalChinese;
        keyboard.engine.addInput("a");
        keyboard.engine.addInput("b");
        compare(typed.text, "ab");
        compare(keyboard.engine.candidates, ["AB"]);
        verify(keyboard.engine.characterSupported("b"));
        verify(!keyboard.engine.characterSupported("ab9"));
        keyboard.engine.selectCandidate(0);
        compare(keyboard.engine.currentConfirmedInputString, "AB");
        compare(typed.text, "");
    }

    function test_languages() {
        languages.bundleId = "Europe";
        compare(offered.text, "2 of Europe");
        verify(languages.mapped(0) >= 0);
        compare(languages.mapped(7), -1);
    }

    function test_intents() {
        const dial = HmiIntents.intentMonitor(HmiIntents.MakePhoneCall);
        verify(dial.enabled);
        fixture.setPhone(false);
        verify(!dial.enabled);
        verify(!HmiIntents.requestAction(HmiIntents.MakePhoneCall, ["112"]));
        compare(toldIntents, " failed 1 no phone");
        verify(fixture.takeWarning("The IntentHandler failed to perform an action.\n Intent type: 1"));
        fixture.setPhone(true);
        verify(dial.enabled);
        verify(HmiIntents.requestAction(HmiIntents.MakePhoneCall, ["112", 7]));
        compare(fixture.dialled, ["112", 7]);
        compare(HmiIntents.UserType, 128);
        verify(!HmiIntents.requestAction(HmiIntents.UserType + 1));
        verify(fixture.takeWarning("No handler found for intent type: 129"));
        compare(toldIntents, " failed 1 no phone handled 1 nobody for 129");
    }

    function test_overrides() {
        compare(tile.text, "Phone");
        fixture.overridePhone(true);
        compare(toldOverride, "401 true true");
        compare(tile.text, "Dana's phone");
        compare(HmiOverrides.nameOverrides.length, 1);
        compare(HmiOverrides.iconOverrides.length, 0);
        compare(HmiOverrides.iconOverride(401, "_small"), "");
        fixture.overridePhone(false);
        compare(tile.text, "Phone");
        compare(nameChanges, 2);
        compare(toldOverride, "401 false true");
    }

    function test_keys() {
        fixture.key(89, 2);
        fixture.key(88, 3);
        compare(toldKeys, " up down long");
    }

    function test_properties() {
        compare(HmiRegionPropertyStore.getProperty(1, "unit"), "mile");
        compare(HmiMarketPropertyStore.getProperty(26, "maxPresets"), 12);
        compare(HmiMarketPropertyStore.getProperty(99, "maxPresets"), undefined);
        compare(HmiValueMapper.mappedValue("driveMode", 1), "Sport");
        compare(HmiValueMapper.mappedValue("driveMode", 5), "Unknown");
        compare(HmiLanguagePropertyStore.getLanguageProperty("Europe", "de_DE", "keyboard"), "Qwertz");
        compare(HmiLanguagePropertyStore.getLanguageProperty("Europe", "xx_XX", "keyboard"), "Latin");
    }

    function test_translations() {
        HmiTranslationManager.currentLanguageId = "de_DE";
        compare(HmiTranslationManager.currentLanguageId, "de_DE");
        HmiTranslationManager.currentLanguageId = "fr_FR";
        compare(toldLanguages, " de_DE fr_FR");
    }
}
