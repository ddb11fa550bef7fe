// SPDX-License-Identifier: MIT
#include "engineplugin.h"
#include "keyboardenginetest.h"
#include "pinyinfactory.h"

#include <HmiCore/HmiComplexKeyboard>

#include <QTemporaryFile>
#include <QTest>

using namespace HmiCore;

namespace {
Pinyin::PinyinFactory factory;
}

class TestPinyin : public KeyboardEngineTest
{
    Q_OBJECT

public:
    TestPinyin()
        : KeyboardEngineTest(&factory, {"ni", "nihao", "你好", 60}, KEYS "/pinyin.txt")
    {
    }

private Q_SLOTS:
    void recordings_data()
    {
        addRecordingColumns();
        addRecording("one syllable", "ni", "ni", "", "你");
        addRecording("a phrase", "nihao", "nihao", "", "你好");
        addRecording("a sentence", "zhongguoren", "zhongguoren", "", "中国人");
        addRecording("capitals", "NiHao", "nihao", "", "你好");
        addRecording("initials only", "zgr", "zgr", "", "中国人");
        addRecording("u with dots", "nü", "nv", "", "女");
        addRecording("separated", "xi'an", "xi'an", "", "西安");
        addRecording("not separated", "xian", "xian", "", "线");
        addRecording("no leading separator", "''ni", "ni", "", "你");
        addRecording("removed across a syllable", "nihao - - -", "ni", "", "你");
        addRecording("removed and typed on", "nihao - - - men", "nimen", "", "你们");
        addRecording("all removed", "ni - -", "", "", "");
        addRecording("one too many removed", "ni - - -", "", "", "");
        addRecording("cleared", "nihao !", "", "", "");
        addRecording("phrase taken", "nihao =你好", "", "你好", "吗");
        addRecording("beginning taken, the rest stays", "zhongguoren =中", "guoren", "中", "国人");
        addRecording("beginning of two taken", "zhongguoren =中国", "ren", "中国", "人");
        addRecording("piece by piece", "zhongguoren =中 =国 =人", "", "中国人", "民");
        addRecording("removed after a piece", "zhongguoren =中 - - -", "guo", "中", "国");
        addRecording("separator goes with its syllable", "xi'an =西", "an", "西", "安");
        addRecording("on to the next word", "nihao =你好 women", "women", "你好", "我们");
        addRecording("prediction taken", "nihao =你好 =吗", "", "你好吗", "");
        addRecording("cleared after a word", "nihao =你好 !", "", "你好", "");
        addRecording("digits and signs are no keys", "n1i. hao", "nihao", "", "你好");
        addRecording("neither are Chinese characters", "n你i", "ni", "", "你");
        addRecording("no syllable", "vv", "vv", "", "");
    }

    void recordings() { checkRecording(); }

    void nothingIsOfferedForNothing()
    {
        const Engine engine = makeEngine();
        QCOMPARE(engine->candidates(), QStringList());
        engine->setMaxCandidateCount(5);
        QCOMPARE(engine->candidates(), QStringList());
        play(*engine, "ni !");
        QCOMPARE(engine->candidates(), QStringList());
        play(*engine, "nihao =你好 !");
        QCOMPARE(engine->candidates(), QStringList());
    }

    void keyOfSeveralLettersIsRemovedByLetters()
    {
        const Engine engine = makeEngine();
        engine->addInput(QStringLiteral("zh"));
        engine->addInput(QStringLiteral("ong"));
        QCOMPARE(engine->currentInput().size(), 5);
        QCOMPARE(engine->candidates().constFirst(), text("中"));
        engine->removeInput();
        QCOMPARE(engine->currentInputString(), QStringLiteral("zhon"));
        engine->removeInput();
        engine->removeInput();
        QCOMPARE(engine->currentInputString(), QStringLiteral("zh"));
        QCOMPARE(engine->currentInput().size(), 2);
    }

    void longInputIsTakenPieceByPiece()
    {
        const Engine engine = makeEngine();
        const QStringList syllables{QStringLiteral("zhong"), QStringLiteral("hua"),  QStringLiteral("ren"),
                                    QStringLiteral("min"),   QStringLiteral("gong"), QStringLiteral("he"),
                                    QStringLiteral("guo")};
        for (const QString& syllable : syllables)
            perform(*engine, syllable);
        while (!engine->currentInput().isEmpty()) {
            const int before = int(engine->currentInput().size());
            engine->selectCandidate(0);
            QVERIFY(engine->currentInput().size() < before);
        }
        QCOMPARE(engine->currentConfirmedInputString(), text("中华人民共和国"));
    }

    /// The library ends the process when it has too many possibilities.
    void manyInitialsDoNotExhaustTheDecoder_data()
    {
        QTest::addColumn<QString>("initials");
        for (char letter = 'a'; letter <= 'z'; ++letter)
            QTest::addRow("%c", letter) << QString(60, QLatin1Char(letter));
        const QStringList mixed{QStringLiteral("zhcs"), QStringLiteral("z'"), QStringLiteral("zcsjqx"),
                                QStringLiteral("aeo")};
        for (const QString& letters : mixed)
            QTest::addRow("%s", qPrintable(letters)) << letters.repeated(20);
    }

    void manyInitialsDoNotExhaustTheDecoder()
    {
        QFETCH(QString, initials);
        const Engine engine = makeEngine();
        perform(*engine, initials);
        QVERIFY(engine->currentInput().size() > 30);
        while (engine->candidateCount() > 0 && !engine->currentInput().isEmpty()) {
            const int before = int(engine->currentInput().size());
            engine->selectCandidate(engine->candidateCount() - 1);
            QVERIFY(engine->currentInput().size() < before);
        }
    }

    void offersAsManyPredictionsAsWanted()
    {
        const Engine engine = makeEngine();
        play(*engine, "nihao =你好");
        QCOMPARE(engine->candidateCount(), 10);
        engine->setMaxCandidateCount(2);
        QCOMPARE(engine->candidateCount(), 2);
    }

    void predictionsStayWhenTheTextIsTaken()
    {
        const Engine engine = makeEngine();
        connect(engine.get(), &HmiComplexKeyboardEngine::currentConfirmedInputStringChanged, engine.get(),
                [&engine] { engine->setCurrentConfirmedInputString(QString()); });
        play(*engine, "nihao =你好");
        QCOMPARE(engine->currentConfirmedInputString(), QString());
        QVERIFY(engine->candidates().contains(text("吗")));
        play(*engine, "=吗");
        QCOMPARE(engine->currentInputString(), QString());
    }

    void predictsWhatFollowsTheTextOfTheField_data()
    {
        QTest::addColumn<QString>("field");
        QTest::addColumn<bool>("some");
        QTest::newRow("a word") << text("你好") << true;
        QTest::newRow("a long text") << text("今天天气很好我们去看你好") << true;
        QTest::newRow("Latin") << QStringLiteral("hello world") << false;
        QTest::newRow("half a pair") << QString(QChar(0xD840)) << false;
        QTest::newRow("null characters") << QString(20, QChar(0)) << false;
    }

    void predictsWhatFollowsTheTextOfTheField()
    {
        QFETCH(QString, field);
        QFETCH(bool, some);
        const Engine engine = makeEngine();
        engine->setCurrentConfirmedInputString(field);
        QCOMPARE(!engine->candidates().isEmpty(), some);
    }

    void enginesDoNotFindEachOthersInput()
    {
        const Engine first = makeEngine();
        const Engine second = makeEngine();
        play(*first, "zhong");
        play(*second, "ni");
        play(*first, "guoren");
        QCOMPARE(first->candidates().constFirst(), text("中国人"));
        play(*first, "=中");
        play(*second, "hao");
        QCOMPARE(second->candidates().constFirst(), text("你好"));
        QCOMPARE(first->candidates().constFirst(), text("国人"));
        play(*second, "=你好");
        play(*first, "=国人");
        QCOMPARE(first->currentConfirmedInputString(), text("中国人"));
        QCOMPARE(second->currentConfirmedInputString(), text("你好"));
    }

    void decoderStaysOpenForTheOthers()
    {
        for (int i = 0; i < 20; ++i) {
            Engine engine = makeEngine();
            Engine other = makeEngine();
            play(*engine, "ni");
            other.reset();
            play(*engine, "hao");
            QCOMPARE(engine->candidates().constFirst(), text("你好"));
        }
    }

    void keysForCharacters_data()
    {
        addKeysColumns();
        addKeys("one", text("中"), "zhong");
        addKeys("several", text("你好"), "nihao");
        addKeys("u with dots", text("女"), "nv");
        addKeys("u with dots before e", text("略"), "lue");
        addKeys("begins with a vowel", text("西安"), "xi'an");
        addKeys("second reading, as the dictionary has it", text("儿"), "er");
        addCharactersWithoutKeys();
    }

    void keysForCharacters() { checkKeys(); }

    void missingDictionaryMakesNoEngine()
    {
        Pinyin::PinyinFactory factory(QStringLiteral("no such dictionary"), nullptr);
        const Engine engine(factory.createEngine(nullptr));
        QVERIFY(!engine);
        QVERIFY(m_log->takeOne(QtWarningMsg, QStringLiteral("Cannot open the dictionary \"no such dictionary\"")));
        QVERIFY(makeEngine());
    }

    void emptyDictionaryMakesNoEngine()
    {
        QTemporaryFile file;
        QVERIFY(file.open());
        Pinyin::PinyinFactory factory(file.fileName(), nullptr);
        const Engine engine(factory.createEngine(nullptr));
        QVERIFY(!engine);
        QVERIFY(m_log->takeOne(QtWarningMsg, QStringLiteral("Cannot open the dictionary \"%1\"").arg(file.fileName())));
    }

    void pluginRegistersItsLanguage()
    {
        registerPlugin(QStringLiteral(PLUGIN_FILE), {QStringLiteral("SimplifiedChinese")}, QStringLiteral("Latin"));
        if (QTest::currentTestFailed())
            return;
        HmiComplexKeyboard keyboard;
        keyboard.setLanguage(HmiComplexKeyboard::SimplifiedChinese);
        play(*keyboard.engine(), "nihao");
        QCOMPARE(keyboard.engine()->candidates().constFirst(), text("你好"));
    }
};

QTEST_GUILESS_MAIN(TestPinyin)
#include "tst_pinyin.moc"
