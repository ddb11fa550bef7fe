// SPDX-License-Identifier: MIT
#include <HmiCore/HmiApplication>
#include <HmiCore/HmiComplexKeyboard>
#include <HmiCore/HmiInitializer>
#include <HmiStateMachine/HmiState>
#include <HmiStateMachine/PopupState>
#include <HmiStateMachine/StateMachine>

#include <QTest>

using HmiCore::HmiApplication;
using HmiCore::HmiComplexKeyboard;
using HmiCore::HmiComplexKeyboardEngine;
using HmiStateMachine::HmiState;
using HmiStateMachine::StateMachine;

namespace {

constexpr int language = LANGUAGE_NUMBER;

/// A head unit with nothing in it.
class Initializer : public HmiCore::HmiInitializer
{
public:
    void initializeSources() override {}
    void connectPopupStates(const QList<QPair<HmiStateMachine::StateLevel, HmiStateMachine::PopupState*>>&) override {}
    void completeInitialization() override {}
    void buildTopStateTree() override { m_modules = new HmiState(QStringLiteral("Modules"), StateMachine::instance()); }
    HmiState* modulesRootState() override { return m_modules; }
    QString rootHierarchyViewDescriptorPath() override { return {}; }
    QString rootHierarchyViewPrefix() override { return {}; }

private:
    HmiState* m_modules = nullptr;
};

} // namespace

/// The plugin, as HmiCore loads it.
class SampleTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { m_keyboard.setLanguage(language); }
    void cleanup() { m_keyboard.setLanguage(HmiComplexKeyboard::Invalid); }

    void aWordIsTypedAndChosen()
    {
        HmiComplexKeyboardEngine* const engine = m_keyboard.engine();
        type(engine, QStringLiteral("hElLo"));
        QCOMPARE(engine->candidates(),
                 QStringList({QStringLiteral("hello"), QStringLiteral("Hello"), QStringLiteral("HELLO")}));
        engine->selectCandidate(1);
        QCOMPARE(engine->currentConfirmedInputString(), QStringLiteral("Hello"));
        QCOMPARE(engine->currentInputString(), QString());
        QCOMPARE(engine->candidateCount(), 0);
    }

    void aLetterIsTakenBack()
    {
        HmiComplexKeyboardEngine* const engine = m_keyboard.engine();
        type(engine, QStringLiteral("ab"));
        engine->removeInput();
        QCOMPARE(engine->candidates(), QStringList({QStringLiteral("a"), QStringLiteral("A")}));
    }

    void oddInputIsRefused()
    {
        HmiComplexKeyboardEngine* const engine = m_keyboard.engine();
        for (const QVariant& key :
             {QVariant(), QVariant(7), QVariant(QStringLiteral("ab")), QVariant(QStringLiteral("!"))})
            engine->addInput(key);
        QCOMPARE(engine->currentInput(), QVariantList());
        type(engine, QString(1000, QLatin1Char('x')));
        QCOMPARE(engine->currentInput().size(), 60);
        engine->selectCandidate(-1);
        engine->selectCandidate(99);
        QCOMPARE(engine->currentConfirmedInputString(), QString());
    }

private:
    static void type(HmiComplexKeyboardEngine* engine, const QString& letters)
    {
        for (const QChar letter : letters)
            engine->addInput(QString(letter));
    }

    HmiComplexKeyboard m_keyboard;
};

int main(int argc, char** argv)
{
    HmiApplication application(argc, argv);
    Initializer initializer;
    application.initialize(&initializer);
    SampleTest test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_sample.moc"
