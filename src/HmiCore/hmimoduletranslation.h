// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QObject>
#include <QString>

QT_BEGIN_NAMESPACE
class QTranslator;
QT_END_NAMESPACE

namespace HmiCore {

/// \brief The translations of one module: a catalogue for each language. GUI thread only.
///
/// A module makes one and hands it to HmiTranslationManager::registerModuleTranslation(); it must live as long as the HMI.
class HMICORE_EXPORT HmiModuleTranslation : public QObject
{
    Q_OBJECT

public:
    /// \brief Catalogues are named \a moduleId, \a translationPath, a variant of the language and ".qm", all in one.
    ///
    /// Such as "/opt/hmi/translations/radio" and "_" for radio_de_DE.qm or radio_de.qm. Relative names begin at the working
    /// directory.
    HmiModuleTranslation(const QString& moduleId, const QString& translationPath, QObject* parent);
    ~HmiModuleTranslation() override;

    QString moduleId() const;        ///< as given to the constructor
    QString translationPath() const; ///< as given to the constructor

    /// \brief The module's translator, owned by this, made on the first call.
    QTranslator* translator();

    /// \brief loadTranslation().
    bool activateTranslation(const QString& languageId) const;

    /// \brief Loads the catalogue of a language into the translator. False without one, or before translator() was called.
    virtual bool loadTranslation(const QString& languageId) const;

private:
    const QString m_moduleId;
    const QString m_translationPath;
    QTranslator* m_translator = nullptr;
};

} // namespace HmiCore
