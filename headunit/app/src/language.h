// SPDX-License-Identifier: MIT
#pragma once

#include <HmiCore/HmiTranslation>

#include <QObject>
#include <QString>

QT_BEGIN_NAMESPACE
class QQmlEngine;
QT_END_NAMESPACE

class Market;

/// \brief Keeps the HMI in the language of the vehicle, as far as the market offers it. GUI thread only.
///
/// A language that the market's bundle lacks is replaced by the bundle's default. When its catalogues are missing or damaged,
/// the language before stays, complete, and the vehicle is asked to go back to it.
class Language : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QString dateFormat READ dateFormat NOTIFY changed)
    Q_PROPERTY(QString keyboard READ keyboard NOTIFY changed)

public:
    Language(Market* market, QQmlEngine* engine, QObject* parent);
    ~Language() override;

    /// \brief Begins: call it once, when all modules have registered their translations.
    void start();

    /// \brief Asks the vehicle for a language, by the platform's number.
    Q_INVOKABLE void choose(int language);

    QString dateFormat() const; ///< as QLocale takes it
    QString keyboard() const;   ///< layout to type texts with, such as "Latin"

Q_SIGNALS:
    /// \brief All texts, the direction and the fonts are those of another language.
    void changed();
    /// \brief The language cannot be used; \a name is its own name for itself.
    void refused(const QString& name);

private:
    void follow();
    void present();
    void showTexts();
    QVariant property(const char* name) const;

    Market* const m_market;
    QQmlEngine* const m_engine;
    HmiCore::HmiTranslation m_translation;
};
