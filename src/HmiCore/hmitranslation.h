// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QDir>
#include <QObject>
#include <QString>
#include <QVector>

namespace HmiCore {

class HmiTranslator;

/// \brief The HMI's own translations: all catalogues of a directory that have the language in their name. GUI thread only.
class HMICORE_EXPORT HmiTranslation : public QObject
{
    Q_OBJECT

public:
    HmiTranslation(const QString& translationDirectory, QObject* parent);
    /// \brief Its translators go with it.
    ~HmiTranslation() override;

    /// \brief Installs a translator for each catalogue whose file name contains \a languageId, in place of those before.
    ///
    /// Catalogues that cannot be loaded, or are damaged, are left out with a warning. False when none is left: the translators
    /// that were installed are gone then, too. False, and nothing changes, for an empty language.
    bool activateTranslation(const QString& languageId);

    /// \brief Takes all translators away.
    void deactivate();

private:
    void removeLastTranslator();

    QDir m_directory;
    QVector<HmiTranslator*> m_translators;
};

} // namespace HmiCore
