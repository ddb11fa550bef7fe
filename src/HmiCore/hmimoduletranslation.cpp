// SPDX-License-Identifier: MIT
#include "hmimoduletranslation.h"

#include "catalogue.h"

#include <QLocale>
#include <QTranslator>

namespace HmiCore {

HmiModuleTranslation::HmiModuleTranslation(const QString& moduleId, const QString& translationPath, QObject* parent)
    : QObject(parent)
    , m_moduleId(moduleId)
    , m_translationPath(translationPath)
{
}

HmiModuleTranslation::~HmiModuleTranslation() = default;

QString HmiModuleTranslation::moduleId() const
{
    return m_moduleId;
}

QString HmiModuleTranslation::translationPath() const
{
    return m_translationPath;
}

QTranslator* HmiModuleTranslation::translator()
{
    if (!m_translator)
        m_translator = new QTranslator(this);
    return m_translator;
}

bool HmiModuleTranslation::activateTranslation(const QString& languageId) const
{
    return loadTranslation(languageId);
}

bool HmiModuleTranslation::loadTranslation(const QString& languageId) const
{
    // The id is the file's name and the path its prefix: that is how modules name their catalogues.
    return m_translator && Catalogue::load(m_translator, QLocale(languageId), m_moduleId, m_translationPath);
}

} // namespace HmiCore
