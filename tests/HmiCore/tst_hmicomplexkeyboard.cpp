// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiCore/DummyEngine>
#include <HmiCore/HmiComplexKeyboard>
#include <HmiCore/HmiComplexKeyboardEngine>
#include <HmiCore/HmiComplexKeyboardEngineFactory>

#include <QMetaMethod>
#include <QPointF>
#include <QPointer>
#include <QQmlEngine>
#include <QSignalSpy>
#include <QTest>

#include <memory>
#include <optional>

#include <malloc.h>

using namespace HmiCore;

namespace {

const QString core = QStringLiteral("kest.hmicore");

QString text(const char* utf8)
{
    return QString::fromUtf8(utf8);
}

/// Writes down what its handlers are told, with the state that they find.
class Engine : public HmiComplexKeyboardEngine
{
    Q_OBJECT

public:
    explicit Engine(QObject* parent = nullptr)
        : HmiComplexKeyboardEngine(parent)
    {
        connect(this, &HmiComplexKeyboardEngine::currentInputChanged, this,
                [this](const QVariantList& input) { journal.append(QStringLiteral("input %1").arg(input.size())); });
        connect(this, &HmiComplexKeyboardEngine::currentInputStringChanged, this,
                [this](const QString& input) { journal.append(QStringLiteral("text %1").arg(input)); });
        connect(this, &HmiComplexKeyboardEngine::currentConfirmedInputStringChanged, this,
                [this](const QString& input) { journal.append(QStringLiteral("confirmed %1").arg(input)); });
        connect(this, &HmiComplexKeyboardEngine::candidatesChanged, this, [this](const QStringList& list) {
            journal.append(QStringLiteral("candidates %1").arg(list.join(QLatin1Char(','))));
        });
        connect(this, &HmiComplexKeyboardEngine::candidateCountChanged, this,
                [this](int count) { journal.append(QStringLiteral("count %1").arg(count)); });
        connect(this, &HmiComplexKeyboardEngine::maxCandidateCountChanged, this,
                [this](int count) { journal.append(QStringLiteral("limit %1").arg(count)); });
    }

    QStringList take() { return std::exchange(journal, QStringList()); }

    QString unsupported;
    mutable QString asked;

protected:
    void handleNewInputValue(const QVariant& value) override
    {
        journal.append(QStringLiteral("new %1 of %2").arg(value.toString()).arg(currentInput().size()));
    }
    void handleInputValueRemoved() override
    {
        journal.append(QStringLiteral("removed, left %1").arg(currentInput().size()));
    }
    void handleInputCleared() override { journal.append(QStringLiteral("cleared")); }
    void handleCandidateSelection(int index) override { journal.append(QStringLiteral("selected %1").arg(index)); }
    void handleMaxCandidateCountChanged() override { journal.append(QStringLiteral("handled limit")); }
    void handleNewConfirmedInputString(const QString& input) override
    {
        journal.append(QStringLiteral("handled %1").arg(input));
    }
    QVariant handleCharactersInputRequest(const QString& characters) override
    {
        return QStringLiteral("for %1").arg(characters);
    }
    QVariant handleCharacterInputRequest(const QChar& character) override
    {
        return QStringLiteral("first %1").arg(character);
    }
    bool supported(const QChar& character) const override
    {
        asked.append(character);
        return !unsupported.contains(character);
    }

private:
    QStringList journal;
};

class EngineFactory : public HmiComplexKeyboardEngineFactory
{
public:
    EngineFactory()
        : HmiComplexKeyboardEngineFactory(nullptr)
    {
    }
    HmiComplexKeyboardEngine* createEngine(QObject* parent) override { return fails ? nullptr : new Engine(parent); }
    bool fails = false;
};

} // namespace

class HmiComplexKeyboardTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;

private Q_SLOTS:
    void init() { log.emplace(); }
    void cleanup()
    {
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        log.reset();
    }

    void theMetaObjectsAreThoseOfTheContract()
    {
        const QMetaObject& meta = HmiComplexKeyboardEngine::staticMetaObject;
        QStringList methods;
        for (int i = meta.methodOffset(); i < meta.methodCount(); ++i)
            methods.append(QString::fromLatin1(meta.method(i).methodSignature()));
        QCOMPARE(methods,
                 QStringList({text("currentInputChanged(QVariantList)"), text("currentInputStringChanged(QString)"),
                              text("currentConfirmedInputStringChanged(QString)"),
                              text("candidatesChanged(QStringList)"), text("candidateCountChanged(int)"),
                              text("maxCandidateCountChanged(int)"), text("addInput(QVariant)"), text("removeInput()"),
                              text("clearInput()"), text("selectCandidate(int)"), text("setMaxCandidateCount(int)"),
                              text("inputForCharacters(QString)"), text("inputForFirstCharacter(QString)"),
                              text("characterSupported(QString)")}));
        const QMetaObject& keyboard = HmiComplexKeyboard::staticMetaObject;
        QCOMPARE(keyboard.method(keyboard.indexOfSignal("engineChanged(HmiCore::HmiComplexKeyboardEngine*)"))
                     .parameterNames(),
                 QList<QByteArray>({"recognizer"}));
    }

    void addingTellsAndThenHandles()
    {
        Engine engine;
        engine.addInput(text("a"));
        QCOMPARE(engine.take(), QStringList({text("input 1"), text("text a"), text("new a of 1")}));
        engine.addInput(text("a"));
        QCOMPARE(engine.take(), QStringList({text("input 2"), text("text aa"), text("new a of 2")}));
        engine.addInput(7);
        QCOMPARE(engine.currentInputString(), text("aa7"));
        QCOMPARE(engine.currentInput(), QVariantList({text("a"), text("a"), 7}));
    }

    void valuesOfQmlAreOpened()
    {
        QQmlEngine qml;
        Engine engine;
        engine.addInput(QVariant::fromValue(qml.evaluate(text("['n', 'i']"))));
        QCOMPARE(engine.currentInput(), QVariantList({QVariantList({text("n"), text("i")})}));
    }

    void removingShortensTheTextOfSingleCharacters()
    {
        Engine engine;
        engine.removeInput();
        QCOMPARE(engine.take(), QStringList());
        engine.addInput(text("a"));
        engine.addInput(text("b"));
        engine.take();
        engine.removeInput();
        QCOMPARE(engine.take(), QStringList({text("text a"), text("input 1"), text("removed, left 1")}));
        QCOMPARE(engine.currentInput(), QVariantList({text("a")}));
    }

    void removingLeavesTheTextOfLongerValues()
    {
        Engine engine;
        engine.addInput(text("zh"));
        engine.take();
        engine.removeInput();
        QCOMPARE(engine.take(), QStringList({text("input 0"), text("removed, left 0")}));
        QCOMPARE(engine.currentInputString(), text("zh"));
    }

    void clearingTellsAlways()
    {
        Engine engine;
        engine.clearInput();
        QCOMPARE(engine.take(), QStringList({text("input 0"), text("text "), text("cleared")}));
    }

    void selectingOnlyHandles()
    {
        Engine engine;
        for (const int index : {3, -1, 1000000})
            engine.selectCandidate(index);
        QCOMPARE(engine.take(), QStringList({text("selected 3"), text("selected -1"), text("selected 1000000")}));
    }

    void limits()
    {
        Engine engine;
        QCOMPARE(engine.maxCandidateCount(), 10);
        for (const int count : {0, -5, 10})
            engine.setMaxCandidateCount(count);
        QCOMPARE(engine.take(), QStringList());
        engine.setMaxCandidateCount(4);
        QCOMPARE(engine.take(), QStringList({text("limit 4"), text("handled limit")}));
    }

    void candidatesAndConfirmedText()
    {
        Engine engine;
        engine.setCandidates({text("中"), text("国")});
        engine.setCandidates({text("中"), text("国")});
        QCOMPARE(engine.take(), QStringList({text("candidates 中,国"), text("count 2")}));
        QVERIFY(engine.setProperty("currentConfirmedInputString", text("中")));
        engine.setCurrentConfirmedInputString(text("中"));
        QCOMPARE(engine.take(), QStringList({text("confirmed 中"), text("handled 中")}));
    }

    void replacingTheInput()
    {
        Engine engine;
        engine.setInput({text("zh"), 1});
        QCOMPARE(engine.take(), QStringList({text("input 2"), text("text zh1")}));
        engine.setInput({text("zh"), 1});
        QCOMPARE(engine.take(), QStringList());
        engine.setInputString(text("ni"));
        QCOMPARE(engine.take(), QStringList({text("input 2"), text("text ni")}));
        QCOMPARE(engine.currentInput(), QVariantList({QChar(QLatin1Char('n')), QChar(QLatin1Char('i'))}));
        engine.setInputString(text("ni"));
        QCOMPARE(engine.take(), QStringList());
    }

    void surrogatesAndMarksAreUnits()
    {
        Engine engine;
        engine.setInputString(text("𠀀é")); // two and, decomposed, two units
        QCOMPARE(engine.currentInput().size(), engine.currentInputString().size());
        engine.addInput(text("𠀀"));
        const int before = int(engine.currentInputString().size());
        engine.removeInput(); // one value, two units: the engine mends the text
        QCOMPARE(engine.currentInputString().size(), before);
    }

    void inputMayBeAnything_data()
    {
        QTest::addColumn<QVariant>("value");
        QTest::newRow("nothing") << QVariant();
        QTest::newRow("an empty text") << QVariant(QString());
        QTest::newRow("not a number") << QVariant(qQNaN());
        QTest::newRow("a point") << QVariant(QPointF(1, 2));
        QTest::newRow("a list") << QVariant(QVariantList{1, QVariantList{2}});
        QTest::newRow("a map") << QVariant(QVariantMap{{text("key"), 1}});
        QTest::newRow("half a pair") << QVariant(QString(QChar(0xD840)));
        QTest::newRow("the other half") << QVariant(QChar(0xDC00));
        QTest::newRow("a pair") << QVariant(text("𠀀"));
        QTest::newRow("a mark alone") << QVariant(QChar(0x0301));
        QTest::newRow("a letter under a thousand marks") << QVariant(text("a") + QString(1000, QChar(0x0301)));
        QTest::newRow("a null character") << QVariant(QChar(0));
        QTest::newRow("a million letters") << QVariant(QString(1000000, QLatin1Char('a')));
    }

    void inputMayBeAnything()
    {
        QFETCH(QVariant, value);
        const QString written = value.toString();
        Engine engine;
        engine.addInput(value);
        engine.addInput(text("b"));
        QCOMPARE(engine.currentInput().size(), 2);
        QCOMPARE(engine.currentInputString(), written + text("b"));
        engine.removeInput();
        QCOMPARE(engine.currentInput().size(), 1);
        QCOMPARE(engine.currentInputString(), written.size() == 1 ? written : written + text("b"));
        engine.setInputString(written);
        QCOMPARE(engine.currentInputString(), written);
        engine.setCurrentConfirmedInputString(written);
        QCOMPARE(engine.currentConfirmedInputString(), written);
        QCOMPARE(engine.characterSupported(written), !written.isEmpty());
        QCOMPARE(engine.inputForFirstCharacter(written).isValid(), !written.isEmpty());
        engine.clearInput();
        QCOMPARE(engine.currentInput(), QVariantList());
        QCOMPARE(engine.currentInputString(), QString());
    }

    void requestsForCharacters()
    {
        Engine engine;
        QCOMPARE(engine.inputForCharacters(text("中国")), QVariant(text("for 中国")));
        QCOMPARE(engine.inputForFirstCharacter(text("中国")), QVariant(text("first 中")));
        QCOMPARE(engine.inputForFirstCharacter(QString()), QVariant());
        QVERIFY(!engine.characterSupported(QString()));
        QVERIFY(engine.asked.isEmpty());
        engine.unsupported = text("b");
        QVERIFY(engine.characterSupported(text("ac")));
        engine.asked.clear();
        QVERIFY(!engine.characterSupported(text("abc")));
        QCOMPARE(engine.asked, text("ab")); // no further
    }

    void aDummyOnlyWarns()
    {
        DummyEngine dummy(nullptr);
        dummy.addInput(text("a"));
        dummy.addInput(text("b"));
        dummy.removeInput();
        dummy.clearInput();
        dummy.selectCandidate(0);
        dummy.setMaxCandidateCount(3);
        dummy.setCurrentConfirmedInputString(text("x"));
        QCOMPARE(dummy.inputForCharacters(text("a")), QVariant());
        QCOMPARE(dummy.inputForFirstCharacter(text("a")), QVariant());
        QVERIFY(dummy.characterSupported(text("anything")));
        QVERIFY(!dummy.characterSupported(QString()));
        const QStringList warnings = log->take(core, QtWarningMsg);
        QCOMPARE(warnings.size(), 7);
        for (const QString& warning : warnings)
            QCOMPARE(warning, text("Using a dummy engine, don't expect too much."));
    }

    void theLanguageChoosesTheEngine()
    {
        EngineFactory factory;
        HmiComplexKeyboard::registerFactory(1, &factory);
        HmiComplexKeyboard keyboard;
        QSignalSpy languages(&keyboard, &HmiComplexKeyboard::languageChanged);
        QSignalSpy engines(&keyboard, &HmiComplexKeyboard::engineChanged);
        const QPointer<HmiComplexKeyboardEngine> dummy = keyboard.engine();
        QVERIFY(qobject_cast<DummyEngine*>(dummy));
        QCOMPARE(engines.size(), 0);
        QVERIFY(keyboard.setProperty("language", int(HmiComplexKeyboard::SimplifiedChinese)));
        keyboard.setLanguage(1);
        QCOMPARE(languages.size(), 1);
        QCOMPARE(engines.size(), 1);
        QVERIFY(qobject_cast<Engine*>(keyboard.engine()));
        QCOMPARE(keyboard.engine()->parent(), &keyboard);
        QVERIFY(dummy);
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QVERIFY(!dummy);

        factory.fails = true;
        HmiComplexKeyboard other;
        other.setLanguage(1);
        other.setLanguage(77);
        QVERIFY(qobject_cast<DummyEngine*>(other.engine()));
        QCOMPARE(log->take(core, QtWarningMsg),
                 QStringList({text("void HmiCore::HmiComplexKeyboard::updateEngine() Engine creation failed."),
                              text("void HmiCore::HmiComplexKeyboard::updateEngine() Unsupported language. 77")}));
    }

    void theLanguageMayChangeInAHandler()
    {
        EngineFactory factory;
        HmiComplexKeyboard::registerFactory(78, &factory);
        HmiComplexKeyboard keyboard;
        keyboard.setLanguage(78);
        const QPointer<HmiComplexKeyboardEngine> typing = keyboard.engine();
        connect(typing, &HmiComplexKeyboardEngine::candidatesChanged, &keyboard, [&] { keyboard.setLanguage(79); });
        typing->setCandidates({text("a")});
        QCOMPARE(log->take(core, QtWarningMsg).size(), 1); // there is none for that
        QVERIFY(typing);
        QVERIFY(keyboard.engine() != typing);
        typing->selectCandidate(0);
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QVERIFY(!typing);
    }

    void manyEnginesLeaveNothingBehind()
    {
        EngineFactory factory;
        HmiComplexKeyboard::registerFactory(80, &factory);
        HmiComplexKeyboard::registerFactory(81, &factory);
        const auto run = [](int count) {
            for (int i = 0; i < count; ++i) {
                HmiComplexKeyboard keyboard;
                keyboard.setLanguage(80);
                keyboard.engine()->addInput(QStringLiteral("a"));
                keyboard.setLanguage(81);
                QCOMPARE(keyboard.engine()->currentInput(), QVariantList());
            }
            QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        };
        run(1000);
        const auto bytes = qint64(mallinfo2().uordblks); // 0 under a sanitizer, which tells itself what is lost
        run(9000);
        const qint64 more = qint64(mallinfo2().uordblks) - bytes;
        QVERIFY2(more < 200000, qPrintable(QStringLiteral("%1 bytes more").arg(more)));
    }

    void theFirstFactoryOfALanguageStays()
    {
        EngineFactory first;
        EngineFactory second;
        HmiComplexKeyboard::registerFactory(5, nullptr);
        HmiComplexKeyboard::registerFactory(5, &first);
        HmiComplexKeyboard::registerFactory(5, &second);
        const QStringList warnings = log->take(core, QtWarningMsg);
        QCOMPARE(warnings.size(), 1);
        QVERIFY(warnings.constFirst().startsWith(
            text("Complex keyboard factory registration failed, duplicated language. 5 ")));
    }
};

QTEST_GUILESS_MAIN(HmiComplexKeyboardTest)
#include "tst_hmicomplexkeyboard.moc"
