// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QObject>
#include <QPointer>
#include <QString>
#include <QVector>

QT_BEGIN_NAMESPACE
class QJSEngine;
class QQmlEngine;
QT_END_NAMESPACE

namespace HmiCore {

class HmiModuleTranslation;
class HmiTranslation;

/// \brief Switches the language of the whole HMI, or of nothing of it. GUI thread only.
///
/// It installs catalogues and sets the default locale. Who shows texts asks for them again on currentLanguageIdChanged().
class HMICORE_EXPORT HmiTranslationManager : public QObject
{
    Q_OBJECT
    Q_PROPERTY(
        QString currentLanguageId READ currentLanguageId WRITE setCurrentLanguageId NOTIFY currentLanguageIdChanged)

public:
    /// \brief The one manager, made on the first call as a child of the application object.
    static HmiTranslationManager* instance();
    /// \brief instance() for the QML engine, which does not own it.
    static QObject* translationManagerProvider(QQmlEngine*, QJSEngine*);
    ~HmiTranslationManager() override;

    /// \brief A locale name such as de_DE; empty before the first change.
    QString currentLanguageId() const;

    /// \brief Makes \a translation, or none (null), the HMI's own translations. It is not owned.
    void activateHmiTranslation(HmiTranslation* translation);

    /// \brief Adds the translations of a module, which must live as long as the manager. Null is ignored.
    ///
    /// What it loads from now on is used; usually that is with the next change of the language.
    void registerModuleTranslation(HmiModuleTranslation* moduleTranslation);

    /// \brief Loads the catalogues of a language everywhere. True only if that succeeded everywhere.
    bool retranslate(const QString& languageId);

public Q_SLOTS:
    /// \brief Changes the language of the HMI and all modules.
    ///
    /// When one of them has no catalogue for it, all go back to the language before, with warnings and without a signal.
    void setCurrentLanguageId(const QString& languageId);

Q_SIGNALS:
    void currentLanguageIdChanged(const QString& arg);

private:
    explicit HmiTranslationManager(QObject* parent);

    QString m_currentLanguageId;
    QPointer<HmiTranslation> m_translation;
    QVector<HmiModuleTranslation*> m_moduleTranslations;
};

} // namespace HmiCore
