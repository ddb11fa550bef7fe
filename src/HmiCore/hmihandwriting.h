// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"
#include "hmihandwritingrecognizer.h"

#include <QObject>
#include <QPointer>

namespace HmiCore {

class HmiHandwritingRecognizerFactory;

/// \brief Gives a writing pad the recognizer of its language. GUI thread only.
class HMICORE_EXPORT HmiHandwriting : public QObject
{
    Q_OBJECT
    Q_PROPERTY(HmiCore::HmiHandwritingRecognizer* recognizer READ recognizer NOTIFY recognizerChanged)
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

    explicit HmiHandwriting(QObject* parent = nullptr);
    ~HmiHandwriting() override;

    /// \brief Lets \a factory, which is not owned, make the recognizers of a language from now on.
    ///
    /// The first factory of a language stays; another one is refused with a warning. Null is ignored.
    static void registerFactory(int language, HmiHandwritingRecognizerFactory* factory);

    /// \brief The recognizer of the language, owned by this; one that recognises nothing when there is none. Never null.
    HmiHandwritingRecognizer* recognizer();

    int language() const; ///< Invalid at first

public Q_SLOTS:
    /// \brief Changes the language and with it, after the signal, the recognizer.
    void setLanguage(int language);

Q_SIGNALS:
    void languageChanged(int language);
    void recognizerChanged(HmiCore::HmiHandwritingRecognizer* recognizer);

private:
    void release();
    void updateRecognizer();

    QPointer<HmiHandwritingRecognizer> m_recognizer;
    int m_language = Invalid;
};

} // namespace HmiCore
