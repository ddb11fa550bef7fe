// SPDX-License-Identifier: MIT
#include "enginelanguages.h"

#include "probelog.h"

#include <HmiCore/HmiComplexKeyboard>
#include <HmiCore/HmiHandwriting>

#include <QJsonObject>

namespace {

constexpr int lastLanguage = 255; // any number can be one; these are looked at

/// Asks for each language as a writing pad or a keyboard does. Without a factory, and when that fails, the core warns.
template <typename Front, typename Engine>
QJsonArray languages(const QString& kind, Engine* (Front::*engine)(), QStringList (*takeWarnings)())
{
    QJsonArray found;
    Front front;
    for (int language = 1; language <= lastLanguage; ++language) {
        takeWarnings();
        front.setLanguage(language);
        const QStringList warnings = takeWarnings();
        if (warnings.size() == 1 && warnings.constFirst().contains(QLatin1String("Unsupported language.")))
            continue;
        for (const QString& warning : warnings)
            ProbeLog::addProblem(QStringLiteral("%1 of language %2: %3").arg(kind).arg(language).arg(warning));
        found +=
            QJsonObject{{QStringLiteral("kind"), kind},
                        {QStringLiteral("language"), language},
                        {QStringLiteral("class"), QString::fromLatin1((front.*engine)()->metaObject()->className())}};
    }
    return found;
}

} // namespace

QJsonArray engineLanguages(QStringList (*takeWarnings)())
{
    QJsonArray found = languages(QStringLiteral("handwriting"), &HmiCore::HmiHandwriting::recognizer, takeWarnings);
    const QJsonArray keyboards =
        languages(QStringLiteral("keyboard"), &HmiCore::HmiComplexKeyboard::engine, takeWarnings);
    for (const auto& keyboard : keyboards)
        found += keyboard;
    return found;
}
