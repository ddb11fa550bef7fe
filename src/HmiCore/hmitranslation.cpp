// SPDX-License-Identifier: MIT
#include "hmitranslation.h"

#include "catalogue.h"
#include "hmitranslator.h"

#include <QCoreApplication>
#include <QDebug>
#include <QFileInfo>

namespace HmiCore {

HmiTranslation::HmiTranslation(const QString& translationDirectory, QObject* parent)
    : QObject(parent)
    , m_directory(translationDirectory, QString(), QDir::NoSort, QDir::Files | QDir::Readable)
{
}

HmiTranslation::~HmiTranslation() = default;

bool HmiTranslation::activateTranslation(const QString& languageId)
{
    if (languageId.isEmpty())
        return false;
    const QList<Catalogue::File> files = Catalogue::filesNamedLike(languageId, m_directory.path());
    while (m_translators.size() < files.size()) {
        m_translators.append(new HmiTranslator(this));
        QCoreApplication::installTranslator(m_translators.constLast());
    }
    int loaded = 0;
    for (const Catalogue::File& file : files) {
        if (Catalogue::load(m_translators.at(loaded), file, m_directory.path()))
            ++loaded;
        else
            qWarning() << "Failed to load translation file:\n" << QFileInfo(file.path).absoluteFilePath();
    }
    while (m_translators.size() > loaded)
        removeLastTranslator();
    return loaded > 0;
}

void HmiTranslation::deactivate()
{
    while (!m_translators.isEmpty())
        removeLastTranslator();
}

/// A look-up of this turn of the event loop may still hold it.
void HmiTranslation::removeLastTranslator()
{
    HmiTranslator* const translator = m_translators.takeLast();
    QCoreApplication::removeTranslator(translator);
    translator->deleteLater();
}

} // namespace HmiCore
