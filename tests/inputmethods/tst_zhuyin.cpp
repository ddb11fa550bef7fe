// SPDX-License-Identifier: MIT
#include "engineplugin.h"
#include "keyboardenginetest.h"
#include "zhuyinfactory.h"

#include <HmiCore/HmiComplexKeyboard>

#include <QTest>

using namespace HmiCore;

namespace {
Zhuyin::ZhuyinFactory factory;
}

class TestZhuyin : public KeyboardEngineTest
{
    Q_OBJECT

public:
    TestZhuyin()
        : KeyboardEngineTest(&factory, {"ㄋㄧˇ", "ㄋㄧˇㄏㄠˇ", "你好", 20}, KEYS "/zhuyin.txt")
    {
    }

private Q_SLOTS:
    void recordings_data()
    {
        addRecordingColumns();
        addRecording("not closed", "ㄋㄧ", "ㄋㄧ", "", "");
        addRecording("one syllable", "ㄋㄧˇ", "ㄋㄧˇ", "", "你");
        addRecording("a phrase", "ㄋㄧˇㄏㄠˇ", "ㄋㄧˇㄏㄠˇ", "", "你好");
        addRecording("a sentence", "ㄓㄨㄥˉㄍㄨㄛˊㄖㄣˊ", "ㄓㄨㄥˉㄍㄨㄛˊㄖㄣˊ", "", "中國人");
        addRecording("the closed ones of more", "ㄋㄧˇㄏㄠ", "ㄋㄧˇㄏㄠ", "", "你");
        addRecording("neutral tone", "ㄇㄚ˙", "ㄇㄚ˙", "", "嗎");
        addRecording("no tone without a syllable", "ˇㄋㄧˇˇ", "ㄋㄧˇ", "", "你");
        addRecording("two initials", "ㄅㄋㄧˇ", "ㄅㄧˇ", "", "比");
        addRecording("no such syllable", "ㄅㄩˋ", "ㄅㄩ", "", "");
        addRecording("removed across a syllable", "ㄋㄧˇㄏㄠˇ - - -", "ㄋㄧˇ", "", "你");
        addRecording("tone removed", "ㄋㄧˇ - ˊ", "ㄋㄧˊ", "", "尼");
        addRecording("all removed", "ㄋㄧˇ - - -", "", "", "");
        addRecording("cleared", "ㄋㄧˇ !", "", "", "");
        addRecording("cleared and typed on", "ㄋㄧˇ ! ㄏㄠˇ", "ㄏㄠˇ", "", "好");
        addRecording("phrase taken", "ㄋㄧˇㄏㄠˇ =你好", "", "你好", "");
        addRecording("beginning taken, the rest stays", "ㄓㄨㄥˉㄍㄨㄛˊㄖㄣˊ =中", "ㄍㄨㄛˊㄖㄣˊ", "中", "國人");
        addRecording("taken before the rest is closed", "ㄋㄧˇㄏㄠ =你", "ㄏㄠ", "你", "");
        addRecording("piece by piece", "ㄓㄨㄥˉㄍㄨㄛˊㄖㄣˊ =中國 =人", "", "中國人", "");
        addRecording("no keys", "nㄋ1ㄧ你ˇ", "ㄋㄧˇ", "", "你");
    }

    void recordings() { checkRecording(); }

    void firstToneIsTheSpaceBar()
    {
        const Engine engine = makeEngine();
        play(*engine, "ㄓㄨㄥ");
        engine->addInput(QStringLiteral(" "));
        QCOMPARE(engine->currentInputString(), text("ㄓㄨㄥˉ"));
        QCOMPARE(engine->candidates().constFirst(), text("中"));
    }

    void enginesDoNotFindEachOthersInput()
    {
        const Engine first = makeEngine();
        Engine second = makeEngine();
        play(*first, "ㄓㄨㄥˉ");
        play(*second, "ㄋㄧˇ");
        play(*first, "ㄍㄨㄛˊ");
        QCOMPARE(first->candidates().constFirst(), text("中國"));
        play(*second, "ㄏㄠˇ");
        QCOMPARE(second->candidates().constFirst(), text("你好"));
        second.reset();
        play(*first, "=中國");
        QCOMPARE(first->currentConfirmedInputString(), text("中國"));
    }

    void createdAndDestroyedBeforeItIsWarm()
    {
        for (int i = 0; i < 30; ++i) {
            const Engine engine = makeEngine();
            if (i % 2)
                play(*engine, "ㄋㄧˇ");
        }
        QCoreApplication::processEvents();
        const Engine engine = makeEngine();
        QCoreApplication::processEvents(); // warms up
        QCOMPARE(engine->candidates(), QStringList());
        QCOMPARE(engine->currentInputString(), QString());
    }

    void keysForCharacters_data()
    {
        addKeysColumns();
        addKeys("one", text("中"), "ㄓㄨㄥˉ");
        addKeys("several", text("你好"), "ㄋㄧˇㄏㄠˇ");
        addKeys("u with dots", text("女"), "ㄋㄩˇ");
        addKeys("u with dots before e", text("略"), "ㄌㄩㄝˋ");
        addKeys("initial alone", text("日"), "ㄖˋ");
        addKeys("no initial", text("雲"), "ㄩㄣˊ");
        addCharactersWithoutKeys();
    }

    void keysForCharacters() { checkKeys(); }

    void missingDictionaryMakesNoEngine()
    {
        Zhuyin::ZhuyinFactory factory(QStringLiteral("no such dictionary"), nullptr);
        const Engine engine(factory.createEngine(nullptr));
        QVERIFY(!engine);
        QVERIFY(m_log->takeOne(QtWarningMsg, QStringLiteral("Cannot open the dictionary in \"no such dictionary\"")));
        QVERIFY(makeEngine());
    }

    void pluginRegistersItsLanguage()
    {
        registerPlugin(QStringLiteral(PLUGIN_FILE), {QStringLiteral("TraditionalChinese")}, QStringLiteral("Latin"));
        if (QTest::currentTestFailed())
            return;
        HmiComplexKeyboard keyboard;
        keyboard.setLanguage(HmiComplexKeyboard::TraditionalChinese);
        play(*keyboard.engine(), "ㄋㄧˇㄏㄠˇ");
        QCOMPARE(keyboard.engine()->candidates().constFirst(), text("你好"));
    }
};

QTEST_GUILESS_MAIN(TestZhuyin)
#include "tst_zhuyin.moc"
