// SPDX-License-Identifier: MIT
#include "keyboardenginetest.h"

#include "processuse.h"
#include "recordings.h"

#include <HmiCore/HmiComplexKeyboard>

#include <QSet>
#include <QTest>

#include <limits>

using namespace HmiCore;

namespace {

constexpr int manyCandidates = 1000;

/// Texts that no person types.
void addOddTexts()
{
    QTest::addColumn<QString>("odd");
    QTest::newRow("Latin") << QStringLiteral("hello world");
    QTest::newRow("half a pair") << QString(QChar(0xD840));
    QTest::newRow("the other half") << QString(QChar(0xDC00));
    QTest::newRow("pair") << QString::fromUtf8("𠀀");
    QTest::newRow("pairs the wrong way round") << QString(QChar(0xDC00)) + QChar(0xD840);
    QTest::newRow("combining mark") << QString(QChar(0x0301));
    QTest::newRow("letter and combining mark") << QStringLiteral("n") + QChar(0x0301);
    QTest::newRow("a thousand combining marks") << QStringLiteral("a") + QString(1000, QChar(0x0301));
    QTest::newRow("null characters") << QString(20, QChar(0));
    QTest::newRow("right to left") << QString::fromUtf8("\u202Eعربي");
    QTest::newRow("too long") << QString(100000, QLatin1Char('a'));
    QTest::newRow("Chinese, too long") << QString(100000, QChar(0x4E2D));
}

} // namespace

KeyboardEngineTest::KeyboardEngineTest(HmiComplexKeyboardEngineFactory* factory, const Sample& sample,
                                       const char* typedWords)
    : m_factory(factory)
    , m_sample(sample)
    , m_typedWords(text(typedWords))
{
}

Engine KeyboardEngineTest::makeEngine() const
{
    return Engine(m_factory->createEngine(nullptr));
}

void KeyboardEngineTest::perform(HmiComplexKeyboardEngine& engine, const QString& step)
{
    if (step == QLatin1String("-"))
        return engine.removeInput();
    if (step == QLatin1String("!"))
        return engine.clearInput();
    if (step.startsWith(QLatin1Char('='))) {
        const int index = int(engine.candidates().indexOf(step.mid(1)));
        QVERIFY2(index >= 0,
                 qPrintable(step + QStringLiteral(" is not among ") + engine.candidates().join(QLatin1Char(' '))));
        return engine.selectCandidate(index);
    }
    for (const QChar letter : step)
        engine.addInput(QString(letter));
}

void KeyboardEngineTest::play(HmiComplexKeyboardEngine& engine, const char* recording)
{
    const QStringList steps = text(recording).split(QLatin1Char(' '));
    for (const QString& step : steps) {
        perform(engine, step);
        if (QTest::currentTestFailed())
            return;
    }
}

void KeyboardEngineTest::addRecordingColumns()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<QString>("input");
    QTest::addColumn<QString>("confirmed");
    QTest::addColumn<QString>("candidate");
}

void KeyboardEngineTest::addRecording(const char* name, const char* keys, const char* input, const char* confirmed,
                                      const char* candidate)
{
    QTest::newRow(name) << QByteArray(keys) << text(input) << text(confirmed) << text(candidate);
}

void KeyboardEngineTest::checkRecording() const
{
    QFETCH(QByteArray, keys);
    QFETCH(QString, input);
    QFETCH(QString, confirmed);
    QFETCH(QString, candidate);
    const Engine engine = makeEngine();
    QVERIFY(engine);
    engine->setMaxCandidateCount(300);
    play(*engine, keys.constData());
    if (QTest::currentTestFailed())
        return;
    QCOMPARE(engine->currentInputString(), input);
    QCOMPARE(engine->currentInput().size(), input.size());
    QCOMPARE(engine->currentConfirmedInputString(), confirmed);
    const QByteArray offered = engine->candidates().join(QLatin1Char(' ')).toUtf8();
    if (candidate.isEmpty())
        QVERIFY2(engine->candidates().isEmpty() || input.isEmpty(), offered.constData());
    else
        QVERIFY2(engine->candidates().mid(0, 10).contains(candidate), offered.constData());
}

void KeyboardEngineTest::addKeysColumns()
{
    QTest::addColumn<QString>("characters");
    QTest::addColumn<QString>("keys");
}

void KeyboardEngineTest::addKeys(const char* name, const QString& characters, const char* keys)
{
    QTest::newRow(name) << characters << text(keys);
}

void KeyboardEngineTest::addCharactersWithoutKeys()
{
    addKeys("none", QString(), "");
    addKeys("Latin", QStringLiteral("a"), "");
    addKeys("partly", text("你a好"), "");
    addKeys("Hiragana", text("の"), "");
    addKeys("half a pair", QString(QChar(0xDC00)), "");
    addKeys("pair", text("𠀀"), "");
    addKeys("combining mark", QString(QChar(0x0301)), "");
    addKeys("with a combining mark", text("你") + QChar(0x0301), "");
}

/// And they do type them: a key each.
void KeyboardEngineTest::checkKeys() const
{
    QFETCH(QString, characters);
    QFETCH(QString, keys);
    const Engine engine = makeEngine();
    const QVariant answer = engine->inputForCharacters(characters);
    QCOMPARE(answer.isValid(), !keys.isEmpty());
    QCOMPARE(engine->characterSupported(characters), !keys.isEmpty());
    engine->setMaxCandidateCount(manyCandidates);
    const QVariantList values = answer.toList();
    for (const QVariant& value : values)
        engine->addInput(value);
    QCOMPARE(engine->currentInputString(), keys);
    QCOMPARE(engine->candidates().contains(characters), !keys.isEmpty());
}

void KeyboardEngineTest::init()
{
    m_log.emplace();
}

void KeyboardEngineTest::cleanup()
{
    QCOMPARE(m_log->unexpected(), QStringList());
    m_log.reset();
}

void KeyboardEngineTest::wordsAreFound_data()
{
    QTest::addColumn<QVariantList>("keys");
    QTest::addColumn<QString>("word");
    QTest::addColumn<int>("among");
    QString error;
    const QList<Recording> words = Recordings::typed(m_typedWords, &error);
    QCOMPARE(error, QString());
    QVERIFY(words.size() >= 30);
    for (const Recording& typed : words)
        QTest::newRow(typed.meant.toUtf8().constData()) << typed.input << typed.meant << typed.among;
}

void KeyboardEngineTest::wordsAreFound()
{
    QFETCH(QVariantList, keys);
    QFETCH(QString, word);
    QFETCH(int, among);
    const Engine engine = makeEngine();
    for (const QVariant& key : keys)
        engine->addInput(key);
    const int place = int(engine->candidates().indexOf(word));
    QVERIFY2(place >= 0 && place < among, engine->candidates().join(QLatin1Char(' ')).toUtf8().constData());
    engine->selectCandidate(place);
    QCOMPARE(engine->currentConfirmedInputString(), word);
    QCOMPARE(engine->currentInput(), QVariantList());
}

void KeyboardEngineTest::valuesThatAreNoKeysLeaveTheInput_data()
{
    QTest::addColumn<QVariant>("value");
    QTest::newRow("invalid") << QVariant();
    QTest::newRow("empty") << QVariant(QString());
    QTest::newRow("number") << QVariant(7);
    QTest::newRow("infinity") << QVariant(qInf());
    QTest::newRow("list") << QVariant(QVariantList{1, 2});
    QTest::newRow("nested list") << QVariant(QVariantList{QVariantList{QStringLiteral("a")}});
    QTest::newRow("half a pair") << QVariant(QString(QChar(0xD840)));
    QTest::newRow("pair") << QVariant(text("𠀀"));
    QTest::newRow("combining mark") << QVariant(QString(QChar(0x0301)));
    QTest::newRow("key with a combining mark") << QVariant(QStringLiteral("h") + QChar(0x0301));
    QTest::newRow("null character") << QVariant(QString(QChar(0)));
    QTest::newRow("partly") << QVariant(QStringLiteral("h1"));
    QTest::newRow("too long") << QVariant(QString(100000, QLatin1Char('a')));
}

void KeyboardEngineTest::valuesThatAreNoKeysLeaveTheInput()
{
    QFETCH(QVariant, value);
    const Engine engine = makeEngine();
    play(*engine, m_sample.syllable);
    const QString input = engine->currentInputString();
    const QStringList before = engine->candidates();
    engine->addInput(value);
    QCOMPARE(engine->currentInputString(), input);
    QCOMPARE(engine->currentInput().size(), input.size());
    QCOMPARE(engine->candidates(), before);
}

void KeyboardEngineTest::inputThatIsTooLongIsNotTaken()
{
    const Engine engine = makeEngine();
    int size = -1;
    for (int i = 0; i < 200 && engine->currentInput().size() > size; ++i) {
        size = int(engine->currentInput().size());
        play(*engine, m_sample.syllable);
    }
    QVERIFY2(size >= 40 && size < 100, qPrintable(QString::number(size)));
    while (!engine->currentInput().isEmpty()) {
        const int before = int(engine->currentInput().size());
        QVERIFY(engine->candidates().constFirst().size() <= m_sample.longest);
        engine->selectCandidate(0);
        QVERIFY(engine->currentInput().size() < before);
    }
}

void KeyboardEngineTest::indexesThatAreNoCandidatesAreIgnored()
{
    const Engine engine = makeEngine();
    const auto selectOddOnes = [&engine] {
        const int count = engine->candidateCount();
        for (const int index : {-1, count, 100000, std::numeric_limits<int>::max(), std::numeric_limits<int>::min()})
            engine->selectCandidate(index);
    };
    selectOddOnes();
    play(*engine, m_sample.phrase);
    selectOddOnes();
    QCOMPARE(engine->currentInputString(), text(m_sample.phrase));
    QCOMPARE(engine->currentConfirmedInputString(), QString());
}

void KeyboardEngineTest::candidateOfSomebodyElseIsNotTaken()
{
    const Engine engine = makeEngine();
    play(*engine, m_sample.syllable);
    engine->setCandidates({QStringLiteral("other")});
    engine->selectCandidate(0);
    QCOMPARE(engine->currentInputString(), text(m_sample.syllable));
    QCOMPARE(engine->currentConfirmedInputString(), QString());
}

/// What was on offer before is not on offer any more, whatever its index.
void KeyboardEngineTest::selectionAfterTheCandidatesChanged()
{
    const Engine engine = makeEngine();
    play(*engine, m_sample.syllable);
    engine->setMaxCandidateCount(manyCandidates);
    const int last = engine->candidateCount() - 1;
    engine->setMaxCandidateCount(2);
    engine->selectCandidate(last);
    QCOMPARE(engine->currentInputString(), text(m_sample.syllable));
    QCOMPARE(engine->currentConfirmedInputString(), QString());

    const QString first = engine->candidates().constFirst();
    engine->clearInput();
    engine->selectCandidate(0);
    QCOMPARE(engine->currentConfirmedInputString(), QString());

    play(*engine, m_sample.phrase);
    engine->selectCandidate(0); // of the phrase, not of its first syllable
    QCOMPARE(engine->currentConfirmedInputString(), text(m_sample.phraseText));
    QVERIFY(text(m_sample.phraseText) != first);
}

void KeyboardEngineTest::offersAsManyAsWanted()
{
    const Engine engine = makeEngine();
    play(*engine, m_sample.syllable);
    QCOMPARE(engine->candidateCount(), 10);
    engine->setMaxCandidateCount(3);
    QCOMPARE(engine->candidateCount(), 3);
    engine->setMaxCandidateCount(20);
    QCOMPARE(engine->candidateCount(), 20);
    const QStringList all = engine->candidates();
    QCOMPARE(QSet<QString>(all.cbegin(), all.cend()).size(), 20);
    engine->setMaxCandidateCount(std::numeric_limits<int>::max());
    QVERIFY(engine->candidateCount() > 20);
}

void KeyboardEngineTest::choicesAreNotLearned()
{
    const Engine engine = makeEngine();
    play(*engine, m_sample.syllable);
    const QStringList before = engine->candidates();
    for (int i = 0; i < 20; ++i) {
        engine->selectCandidate(9);
        play(*engine, m_sample.syllable);
    }
    QCOMPARE(engine->candidates(), before);
}

void KeyboardEngineTest::confirmedTextMayBeAnything_data()
{
    addOddTexts();
}

void KeyboardEngineTest::confirmedTextMayBeAnything()
{
    QFETCH(QString, odd);
    const Engine engine = makeEngine();
    engine->setCurrentConfirmedInputString(odd);
    play(*engine, m_sample.phrase);
    QCOMPARE(engine->candidates().constFirst(), text(m_sample.phraseText));
    engine->selectCandidate(0);
    QCOMPARE(engine->currentConfirmedInputString(), odd + text(m_sample.phraseText));
}

void KeyboardEngineTest::inputFromOutsideMayBeAnything_data()
{
    addOddTexts();
}

/// setInputString() tells the engine nothing; the next key does.
void KeyboardEngineTest::inputFromOutsideMayBeAnything()
{
    QFETCH(QString, odd);
    const Engine engine = makeEngine();
    engine->setInputString(odd);
    engine->removeInput();
    engine->setInputString(odd);
    play(*engine, m_sample.phrase);
    QCOMPARE(engine->candidates().constFirst(), text(m_sample.phraseText));
    QVERIFY(!engine->inputForCharacters(odd + QLatin1Char('a')).isValid());
    QVERIFY(!engine->characterSupported(odd + QLatin1Char('a')));
}

void KeyboardEngineTest::languageChangedWhileTyping()
{
    HmiComplexKeyboard::registerFactory(101, m_factory);
    HmiComplexKeyboard::registerFactory(102, m_factory);
    HmiComplexKeyboard keyboard;
    for (int i = 0; i < 30; ++i) {
        keyboard.setLanguage(i % 2 ? 101 : 102);
        QCOMPARE(keyboard.engine()->currentInputString(), QString());
        play(*keyboard.engine(), i % 3 ? m_sample.phrase : m_sample.syllable);
        if (i % 5 == 0)
            QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }
    QCOMPARE(keyboard.engine()->candidates().constFirst(), text(m_sample.phraseText));
}

void KeyboardEngineTest::manyEnginesLeaveNothingBehind()
{
    const auto run = [this](int count) {
        for (int i = 0; i < count; ++i) {
            const Engine engine = makeEngine();
            play(*engine, m_sample.syllable);
        }
        QCoreApplication::processEvents();
    };
    run(100);
    const int threads = ProcessUse::threadCount();
    const qint64 bytes = ProcessUse::allocatedBytes();
    run(900);
    QCOMPARE(ProcessUse::threadCount(), threads);
    const qint64 more = ProcessUse::allocatedBytes() - bytes;
    QVERIFY2(more < 200000, qPrintable(QStringLiteral("%1 bytes more").arg(more)));
}

void KeyboardEngineTest::keysForTheFirstCharacter()
{
    const Engine engine = makeEngine();
    QCOMPARE(engine->inputForFirstCharacter(text("好a")), engine->inputForCharacters(text("好")));
    QVERIFY(engine->inputForFirstCharacter(text("好a")).isValid());
    QVERIFY(!engine->inputForFirstCharacter(text("a好")).isValid());
    QVERIFY(!engine->inputForFirstCharacter(text("𠀀")).isValid());
}

/// The whole plane: what counts as supported is on offer after its keys, and that is most of what is in use.
void KeyboardEngineTest::supportedCharactersCanBeTyped()
{
    const Engine engine = makeEngine();
    engine->setMaxCandidateCount(manyCandidates);
    int supported = 0;
    QStringList missing;
    for (int code = 1; code <= 0xFFFF; ++code) {
        const QString character = QChar(code);
        if (!engine->characterSupported(character))
            continue;
        ++supported;
        engine->clearInput();
        const QVariantList keys = engine->inputForCharacters(character).toList();
        for (const QVariant& key : keys)
            engine->addInput(key);
        if (!engine->candidates().contains(character))
            missing.append(character);
    }
    QCOMPARE(missing, QStringList());
    QVERIFY2(supported > 5000, qPrintable(QString::number(supported)));
}
