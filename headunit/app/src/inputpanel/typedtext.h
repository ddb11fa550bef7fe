// SPDX-License-Identifier: MIT
#pragma once

#include "textcomposer.h"

#include <HmiCore/HmiComplexKeyboard>

#include <QPointer>

/// \brief Texts that are typed: as the keys say, or through the keyboard engine of a language.
class TypedText : public TextComposer
{
    Q_OBJECT

public:
    using TextComposer::TextComposer;

    void setLanguage(int language); ///< of HmiComplexKeyboard; Invalid without an engine
    /// \brief What the engine does not take is committed as it is, after what was begun.
    void type(const QString& text);
    /// \brief Between words: decides on the first candidate when something is begun.
    void space();
    void offer(const QStringList& texts); ///< as candidates, until something else is done
    void commitLetters();                 ///< decides on the keys that were pressed, as they are

    void select(int candidate) override;
    bool takeBack() override;
    void finish() override;
    void drop() override;

private:
    bool isTaken(const QString& text);
    void withdrawOffer();
    void follow();
    void takeConfirmed();

    HmiCore::HmiComplexKeyboard m_keyboard{nullptr};
    QPointer<HmiCore::HmiComplexKeyboardEngine> m_engine;
    QStringList m_offered; ///< besides what the engine says
};
