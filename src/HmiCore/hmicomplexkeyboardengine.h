// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QChar>
#include <QObject>
#include <QString>
#include <QStringList>
#include <QVariant>

namespace HmiCore {

/// \brief The base of engines for keyboards whose keys are not yet the text: it turns input into candidates. GUI thread only.
///
/// Each operation changes the state, tells of it, and then calls the engine's handler.
class HMICORE_EXPORT HmiComplexKeyboardEngine : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QVariantList currentInput READ currentInput NOTIFY currentInputChanged)
    Q_PROPERTY(QString currentInputString READ currentInputString NOTIFY currentInputStringChanged)
    Q_PROPERTY(QString currentConfirmedInputString READ currentConfirmedInputString WRITE setCurrentConfirmedInputString
                   NOTIFY currentConfirmedInputStringChanged)
    Q_PROPERTY(QStringList candidates READ candidates WRITE setCandidates NOTIFY candidatesChanged)
    Q_PROPERTY(int candidateCount READ candidateCount NOTIFY candidateCountChanged)
    Q_PROPERTY(int maxCandidateCount READ maxCandidateCount WRITE setMaxCandidateCount NOTIFY maxCandidateCountChanged)

public:
    explicit HmiComplexKeyboardEngine(QObject* parent);
    ~HmiComplexKeyboardEngine() override;

    QVariantList currentInput() const;           ///< the values typed so far
    QString currentInputString() const;          ///< their texts, one after the other
    QString currentConfirmedInputString() const; ///< what is decided on
    QStringList candidates() const;              ///< what the input may be, the most likely first
    int candidateCount() const;                  ///< how many candidates there are
    int maxCandidateCount() const;               ///< how many are wanted at most; 10 by default

    /// \name For engines; equal values change nothing
    /// @{

    /// \brief Replaces the input, and the text by that of its values. No handler is called.
    void setInput(const QList<QVariant>& input);
    /// \brief Replaces the text, and the input by its characters. No handler is called.
    void setInputString(const QString& input);
    void setCandidates(const QStringList& candidates);         ///< no handler is called
    void setCurrentConfirmedInputString(const QString& input); ///< the handler is called
    /// @}

    /// \brief The values that would type \a characters; what the engine answers.
    Q_INVOKABLE QVariant inputForCharacters(const QString& characters);
    /// \brief The values that would type the first of \a characters; invalid for an empty text.
    Q_INVOKABLE QVariant inputForFirstCharacter(const QString& characters);
    /// \brief Whether each UTF-16 unit of \a character can be typed; false for an empty text.
    Q_INVOKABLE bool characterSupported(const QString& character);

public Q_SLOTS:
    /// \brief Appends a value to the input and its text to the text.
    void addInput(const QVariant& input);
    /// \brief Removes the last value; from the text only while each value is one character of it.
    void removeInput();
    void clearInput();                    ///< empties input and text
    void selectCandidate(int index);      ///< \a index is passed on as it is
    void setMaxCandidateCount(int count); ///< below 1 is ignored

Q_SIGNALS:
    void currentInputChanged(const QVariantList& inputList);
    void currentInputStringChanged(const QString& input);
    void currentConfirmedInputStringChanged(const QString& input);
    void candidatesChanged(const QStringList& candidates);
    void candidateCountChanged(int count);
    void maxCandidateCountChanged(int count);

protected:
    virtual void handleNewInputValue(const QVariant& value) = 0; ///< after addInput(), with the value of a key
    virtual void handleInputValueRemoved() = 0;                  ///< after removeInput()
    virtual void handleInputCleared() = 0;                       ///< after clearInput()
    /// \brief The user took a candidate; there may be none of this index any more.
    virtual void handleCandidateSelection(int index) = 0;
    virtual void handleMaxCandidateCountChanged();                                ///< does nothing by default
    virtual void handleNewConfirmedInputString(const QString& input);             ///< does nothing by default
    virtual QVariant handleCharactersInputRequest(const QString& characters) = 0; ///< answers inputForCharacters()
    virtual QVariant handleCharacterInputRequest(const QChar& character) = 0;     ///< answers inputForFirstCharacter()
    virtual bool supported(const QChar& character) const = 0; ///< whether a UTF-16 unit can be typed

private:
    QVariantList m_currentInput;
    QString m_currentInputString;
    QString m_currentConfirmedInputString;
    QStringList m_candidates;
    int m_maxCandidateCount = 10;
};

} // namespace HmiCore
