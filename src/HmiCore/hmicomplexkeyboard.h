// SPDX-License-Identifier: MIT
#pragma once

#include "hmicomplexkeyboardengine.h"
#include "hmicore_export.h"

#include <QObject>
#include <QPointer>

namespace HmiCore {

class HmiComplexKeyboardEngineFactory;

/// \brief Gives an on-screen keyboard the engine of its language. GUI thread only.
class HMICORE_EXPORT HmiComplexKeyboard : public QObject
{
    Q_OBJECT
    Q_PROPERTY(HmiCore::HmiComplexKeyboardEngine* engine READ engine NOTIFY engineChanged)
    Q_PROPERTY(int language READ language WRITE setLanguage NOTIFY languageChanged)

public:
    /// \brief The languages of the engines at hand; others may have any other number.
    enum Language {
        Invalid = 0,
        SimplifiedChinese = 1,
        TraditionalChinese = 2,
        Latin = 3,
    };
    Q_ENUM(Language)

    explicit HmiComplexKeyboard(QObject* parent = nullptr);
    ~HmiComplexKeyboard() override;

    /// \brief Lets \a factory, which is not owned, make the engines of a language from now on.
    ///
    /// The first factory of a language stays; another one is refused with a warning. Null is ignored.
    static void registerFactory(int language, HmiComplexKeyboardEngineFactory* factory);

    /// \brief The engine of the language, owned by this; one that does nothing when there is none. Never null.
    HmiComplexKeyboardEngine* engine();

    int language() const; ///< Invalid at first

public Q_SLOTS:
    /// \brief Changes the language and with it, after the signal, the engine.
    void setLanguage(int language);

Q_SIGNALS:
    void languageChanged(int language);
    void engineChanged(HmiCore::HmiComplexKeyboardEngine* recognizer);

private:
    void updateEngine();

    QPointer<HmiComplexKeyboardEngine> m_engine;
    int m_language = Invalid;
};

} // namespace HmiCore
