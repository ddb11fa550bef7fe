// SPDX-License-Identifier: MIT
#pragma once

#include "globalsource.h"

#include <QAbstractListModel>

namespace AL2HMIBridge {

/// \brief All languages that the platform knows, in order of their numbers. GUI thread only.
class AL2HMIBRIDGE_EXPORT LanguageModel : public QAbstractListModel
{
    Q_OBJECT

public:
    /// \brief What a row tells.
    enum Role : int {
        LocaleRole = 1, ///< locale name, such as de_DE
        NameRole = 2,   ///< name as shown, in the language itself
    };
    Q_ENUM(Role)

    /// \brief The process's one model, made on the first call as a child of the application object.
    static LanguageModel* instance();
    ~LanguageModel() override;

    /// \brief The vehicle offers the language: GlobalSource::supportedLanguages() has it.
    bool languageSupported(GlobalSource::SystemLanguage language) const;

    /// \brief Locale name of a language, empty for one that the platform does not know.
    QString localeFromId(GlobalSource::SystemLanguage language) const;

    /// \brief Number of the language with exactly this locale name, or -1.
    int idForLocale(const QString& locale) const;

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    /// \brief The two roles; the name also as Qt::DisplayRole.
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    /// \brief "locale" and "name".
    QHash<int, QByteArray> roleNames() const override;

private:
    LanguageModel();
};

} // namespace AL2HMIBridge
