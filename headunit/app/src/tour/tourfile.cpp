// SPDX-License-Identifier: MIT
#include "tourfile.h"

#include <HmiCore/HmiIntentManager>
#include <HmiVehicle/keycatalogue.h>

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QMetaEnum>

#include <algorithm>
#include <iterator>

namespace {

constexpr qint64 largestFile = 1 << 20;

using Check = QString (*)(const QJsonObject& line, const QString& field);

QString isText(const QJsonObject& line, const QString& field)
{
    return line.value(field).isString() ? QString() : QStringLiteral("must be a text");
}

QString isAnything(const QJsonObject& line, const QString& field)
{
    return line.contains(field) ? QString() : QStringLiteral("is missing");
}

QString isKey(const QJsonObject& line, const QString& field)
{
    const int key = HmiVehicle::KeyCatalogue::instance().idFrom(line.value(field).toString());
    return key >= 0 ? QString() : QStringLiteral("is no key of the vehicle");
}

QString isField(const QJsonObject& line, const QString& field)
{
    return line.value(field).toString().count(QLatin1Char('.')) == 1 ? QString()
                                                                     : QStringLiteral("must be SOURCE.FIELD");
}

QString isIntent(const QJsonObject& line, const QString& field)
{
    const auto intents = QMetaEnum::fromType<HmiCore::HmiIntentManager::HmiIntent>();
    return intents.keyToValue(line.value(field).toString().toLatin1().constData()) >= 0
               ? QString()
               : QStringLiteral("is no intent");
}

QString isStrokes(const QJsonObject& line, const QString& field)
{
    return line.value(field).toArray().isEmpty() ? QStringLiteral("must be a list of strokes") : QString();
}

QString isOnOrOff(const QJsonObject& line, const QString& field)
{
    const QString text = line.value(field).toString();
    return text == QLatin1String("on") || text == QLatin1String("off") ? QString()
                                                                       : QStringLiteral("must be \"on\" or \"off\"");
}

struct Verb
{
    const char* name;
    Check check;
    const char* needs; ///< a further field, or none
};

constexpr Verb verbs[] = {
    {"note", isText, nullptr},       {"key", isKey, nullptr},       {"turn", isKey, nullptr},
    {"set", isField, "to"},          {"ring", isText, nullptr},     {"announce", isText, nullptr},
    {"vehicle", isOnOrOff, nullptr}, {"language", isText, nullptr}, {"intent", isIntent, nullptr},
    {"tap", isText, nullptr},        {"type", isText, nullptr},     {"write", isStrokes, nullptr},
    {"choose", isText, nullptr},     {"view", isText, nullptr},     {"popup", isText, nullptr},
    {"item", isText, nullptr},       {"focus", isText, nullptr},    {"shot", isText, nullptr},
};

/// The step of a line; a problem when it is none.
QString stepOf(const QByteArray& line, TourFile::Step* step)
{
    QJsonParseError error{};
    step->line = QJsonDocument::fromJson(line, &error).object();
    if (error.error)
        return error.errorString();
    for (const Verb& verb : verbs) {
        const QString name = QString::fromLatin1(verb.name);
        if (!step->line.contains(name))
            continue;
        step->verb = name;
        const QString problem = verb.check(step->line, name);
        if (!problem.isEmpty())
            return QStringLiteral("%1: %2").arg(name, problem);
        if (verb.needs)
            return isAnything(step->line, QString::fromLatin1(verb.needs));
        return QString();
    }
    return QStringLiteral("has no step");
}

} // namespace

bool TourFile::load(const QString& fileName)
{
    m_steps.clear();
    QFile file(fileName);
    if (!file.open(QIODevice::ReadOnly) || file.isSequential() || file.size() > largestFile) {
        m_error = QStringLiteral("%1: %2").arg(fileName, file.isOpen() ? QStringLiteral("is no file of at most 1 MiB")
                                                                       : file.errorString());
        return false;
    }
    for (int number = 1; !file.atEnd(); ++number) {
        const QByteArray line = file.readLine().trimmed();
        if (line.isEmpty())
            continue;
        Step step;
        step.where = QStringLiteral("%1:%2").arg(fileName).arg(number);
        const QString problem = stepOf(line, &step);
        if (!problem.isEmpty()) {
            m_error = QStringLiteral("%1: %2").arg(step.where, problem);
            return false;
        }
        m_steps.append(step);
    }
    m_error = m_steps.isEmpty() ? QStringLiteral("%1: has no steps").arg(fileName) : QString();
    return !m_steps.isEmpty();
}
