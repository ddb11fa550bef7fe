// SPDX-License-Identifier: MIT
#pragma once

#include "fakerecognizer.h"
#include "jsonfiles.h"
#include "logcapture.h"

#include <AL2HMIBridge/BridgeTester>
#include <HmiCore/HmiActivationOverride>
#include <HmiCore/HmiComplexKeyboardEngine>
#include <HmiCore/HmiComplexKeyboardEngineFactory>
#include <HmiCore/HmiHandwritingRecognizerFactory>
#include <HmiCore/HmiIntentHandler>

#include <optional>

/// A keyboard engine whose one candidate is what was typed, in capitals.
class CapitalsEngine : public HmiCore::HmiComplexKeyboardEngine
{
    Q_OBJECT

public:
    using HmiCore::HmiComplexKeyboardEngine::HmiComplexKeyboardEngine;

protected:
    void handleNewInputValue(const QVariant&) override { setCandidates({currentInputString().toUpper()}); }
    void handleInputValueRemoved() override {}
    void handleInputCleared() override {}
    void handleCandidateSelection(int index) override
    {
        setCurrentConfirmedInputString(candidates().value(index));
        clearInput();
    }
    QVariant handleCharactersInputRequest(const QString& characters) override { return characters; }
    QVariant handleCharacterInputRequest(const QChar& character) override { return QString(character); }
    bool supported(const QChar& character) const override { return character.isLetter(); }
};

class CapitalsFactory : public HmiCore::HmiComplexKeyboardEngineFactory
{
public:
    CapitalsFactory()
        : HmiComplexKeyboardEngineFactory(nullptr)
    {
    }
    HmiCore::HmiComplexKeyboardEngine* createEngine(QObject* parent) override { return new CapitalsEngine(parent); }
};

class LengthsFactory : public HmiCore::HmiHandwritingRecognizerFactory
{
public:
    LengthsFactory()
        : HmiHandwritingRecognizerFactory(nullptr)
    {
    }
    HmiCore::HmiHandwritingRecognizer* createRecognizer(QObject* parent) override
    {
        return new FakeRecognizer(std::make_shared<Work>(), parent);
    }
};

/// Dials, as long as there is a phone.
class Dialler : public HmiCore::HmiIntentHandler
{
    Q_OBJECT

public:
    explicit Dialler(QObject* parent);

    bool performAction(int intent, const QList<QVariant>& data, bool vrEvent, const QVariant& vrEventData) override;
    bool isActionEnabled(int intent) const override { return m_hasPhone && HmiIntentHandler::isActionEnabled(intent); }
    QString lastError() const override { return QStringLiteral("no phone"); }
    void setPhone(bool isThere);

    QVariantList dialled;

private:
    bool m_hasPhone = true;
};

/// Calls the phone's module after the phone.
class PhoneOverride : public HmiCore::HmiActivationOverride
{
    Q_OBJECT

public:
    static constexpr int domain = 401;

    explicit PhoneOverride(QObject* parent);

    bool handleOverride(int) override { return false; }
    QString handleNameOverride(int) const override { return QStringLiteral("Dana's phone"); }
    void setActive(bool isActive);
};

/// The modules, the engines, the files and the vehicle behind the types that QML sees.
class TypesFixture : public QObject
{
    Q_OBJECT
    Q_PROPERTY(HmiCore::HmiActivationOverride* phoneOverride READ phoneOverride CONSTANT)
    Q_PROPERTY(QVariantList dialled READ dialled)

public:
    TypesFixture();

    HmiCore::HmiActivationOverride* phoneOverride() { return &m_override; }
    QVariantList dialled() const { return m_dialler.dialled; }

    Q_INVOKABLE void setPhone(bool isThere) { m_dialler.setPhone(isThere); }
    Q_INVOKABLE void overridePhone(bool isOverridden) { m_override.setActive(isOverridden); }
    Q_INVOKABLE void key(int id, int state);

    Q_INVOKABLE void beginCapture() { m_log.emplace(); }
    /// Ends the capture with the warnings that nobody took.
    Q_INVOKABLE QStringList endCapture();
    Q_INVOKABLE bool takeWarning(const QString& message) { return m_log->takeOne(QtWarningMsg, message); }

private:
    std::optional<LogCapture> m_log;
    AL2HMIBridge::BridgeTester m_vehicle;
    Files m_files;
    LengthsFactory m_recognizers;
    CapitalsFactory m_keyboards;
    Dialler m_dialler;
    PhoneOverride m_override;
};
