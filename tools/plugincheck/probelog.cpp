// SPDX-License-Identifier: MIT
#include "probelog.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>

#include <fcntl.h>
#include <unistd.h>

namespace {

constexpr qint64 largestReport = 1 << 20; // bytes; a plugin that warns without end must not fill the disk
int descriptor = -1;

} // namespace

bool ProbeLog::open(const QString& fileName)
{
    descriptor = ::open(QFile::encodeName(fileName).constData(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC, 0600);
    return descriptor >= 0;
}

void ProbeLog::tell(const QJsonObject& members)
{
    const QByteArray line = QJsonDocument(members).toJson(QJsonDocument::Compact) + '\n';
    const bool isFull = members.contains(QLatin1String("problem")) && ::lseek(descriptor, 0, SEEK_END) > largestReport;
    if (!isFull && ::write(descriptor, line.constData(), size_t(line.size())) < 0)
        ::_exit(EXIT_FAILURE); // nobody would learn of anything any more
}

void ProbeLog::enter(const char* stage)
{
    tell({{QStringLiteral("stage"), QString::fromLatin1(stage)}});
}

void ProbeLog::addProblem(const QString& problem)
{
    tell({{QStringLiteral("problem"), problem}});
}

QJsonObject ProbeLog::read(const QString& fileName)
{
    QJsonObject report;
    QJsonArray problems;
    QFile file(fileName);
    if (file.open(QIODevice::ReadOnly)) {
        while (!file.atEnd()) {
            const QJsonObject members = QJsonDocument::fromJson(file.readLine()).object();
            for (auto member = members.begin(); member != members.end(); ++member)
                if (member.key() != QLatin1String("problem"))
                    report.insert(member.key(), member.value());
                else if (!problems.contains(member.value()))
                    problems.append(member.value());
        }
    }
    report.insert(QStringLiteral("problems"), problems);
    return report;
}
