// SPDX-License-Identifier: MIT
#include "scenario.h"

#include "command.h"
#include "linefile.h"

#include <QJsonDocument>

namespace HmiVehicle {

namespace {
constexpr qint64 maximumSize = 16 * 1024 * 1024;
constexpr int longestWait = 3600 * 1000;
} // namespace

bool Scenario::load(const QString& fileName)
{
    m_steps.clear();
    QFile file(fileName);
    m_error = openLines(file, maximumSize);
    for (int number = 1; m_error.isEmpty() && !file.atEnd(); ++number) {
        const QByteArray line = file.readLine().trimmed();
        const QString where = QStringLiteral("%1:%2").arg(fileName).arg(number);
        const QString problem = line.isEmpty() ? QString() : add(line, where);
        if (!problem.isEmpty())
            m_error = where + QStringLiteral(": ") + problem;
    }
    if (m_error.isEmpty() && m_steps.empty())
        m_error = fileName + QStringLiteral(": nothing happens in it");
    return m_error.isEmpty();
}

QString Scenario::add(const QByteArray& line, const QString& where)
{
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(line, &error);
    if (!document.isObject())
        return error.error == QJsonParseError::NoError ? QStringLiteral("not a JSON object") : error.errorString();
    const QJsonObject object = document.object();
    const QJsonValue note = object.value(QLatin1String("note"));
    if (!note.isUndefined() && !note.isString())
        return QStringLiteral("'note' is not a text");
    if (object.size() == 1 && note.isString())
        return QString();
    Step step{where, {}, -1};
    Command command;
    QString problem = Command::wordsOf(object, &step.words);
    if (problem.isEmpty())
        problem = Command::parse(step.words, &command);
    const QJsonValue within = object.value(QLatin1String("within"));
    if (problem.isEmpty() && !within.isUndefined()) {
        step.timeout = within.toInt(-1);
        if (step.timeout < 0 || step.timeout > longestWait)
            return QStringLiteral("'within' is not a number from 0 to %1").arg(longestWait);
    }
    m_steps.push_back(step);
    return problem;
}

bool Scenario::isRecording(const QString& fileName)
{
    QFile file(fileName);
    if (!openLines(file, maximumSize * 16).isEmpty())
        return false;
    const QJsonObject first = QJsonDocument::fromJson(file.readLine()).object();
    return first.contains(QLatin1String("t")) && first.contains(QLatin1String("direction"));
}

} // namespace HmiVehicle
