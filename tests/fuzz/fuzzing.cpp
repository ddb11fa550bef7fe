// SPDX-License-Identifier: MIT
#include "fuzzing.h"

#include <QCoreApplication>
#include <QGuiApplication>
#include <QSet>
#include <QVector>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <sys/mman.h>
#include <unistd.h>

namespace Fuzzing {

namespace {

LogReader s_reader = nullptr;

void handle(QtMsgType type, const QMessageLogContext&, const QString& message)
{
    if (type == QtFatalMsg)
        std::fprintf(stderr, "%s\n", qPrintable(message));
    if (s_reader && type != QtDebugMsg && type != QtInfoMsg)
        s_reader(message);
}

} // namespace

void start(int* argc, char** argv, Application kind)
{
    qInstallMessageHandler(handle);
    qputenv("QT_QPA_PLATFORM", "offscreen");
    qputenv("QT_QUICK_BACKEND", "software");
    qputenv("QT_LOGGING_RULES", "*.debug=false");
    if (kind == Application::Own)
        return;
    static QCoreApplication* const application =
        kind == Application::Gui ? new QGuiApplication(*argc, argv) : new QCoreApplication(*argc, argv);
    std::atexit([] { delete application; });
}

void readLog(LogReader reader)
{
    s_reader = reader;
}

void check(bool holds, const char* rule, const QString& seen)
{
    if (holds)
        return;
    std::fprintf(stderr, "Broken: %s\n%s\n", rule, qPrintable(seen));
    std::abort();
}

bool repeatsKeys(const QByteArray& json)
{
    QVector<QSet<QByteArray>> keys(1); // of the objects around; lists have none
    for (int at = 0; at < json.size(); ++at) {
        const char letter = json.at(at);
        if (letter == '{' || letter == '[')
            keys.append(QSet<QByteArray>());
        if ((letter == '}' || letter == ']') && keys.size() > 1)
            keys.removeLast();
        if (letter != '"')
            continue;
        const int begin = ++at;
        while (at < json.size() && json.at(at) != '"')
            at += json.at(at) == '\\' ? 2 : 1;
        int after = at + 1;
        while (after < json.size()
               && (json.at(after) == ' ' || json.at(after) == '\t' || json.at(after) == '\n' || json.at(after) == '\r'))
            ++after;
        if (after >= json.size() || json.at(after) != ':')
            continue;
        QByteArray key = json.mid(begin, at - begin);
        if (key.contains('\\'))
            key = "\\"; // may be any other one
        QSet<QByteArray>& known = keys.last();
        if (known.contains(key) || known.contains("\\") || (key == "\\" && !known.isEmpty()))
            return true;
        known.insert(key);
    }
    return false;
}

quint64 Input::bits(int bytes)
{
    quint64 value = 0;
    for (int i = 0; i < bytes; ++i)
        value |= quint64(byte()) << (8 * i);
    return value;
}

double Input::real()
{
    const quint64 pattern = bits(8);
    double value = 0;
    std::memcpy(&value, &pattern, sizeof value);
    return value;
}

QString Input::text(int longest)
{
    QString text;
    for (int length = below(longest + 1); length > 0 && !atEnd(); --length)
        text.append(QChar(ushort(bits(2))));
    return text;
}

QByteArray Input::rest()
{
    const QByteArray rest(reinterpret_cast<const char*>(m_at), int(m_end - m_at));
    m_at = m_end;
    return rest;
}

MemoryFile::MemoryFile()
    : m_descriptor(::memfd_create("input", MFD_CLOEXEC))
{
    check(m_descriptor >= 0, "a file in memory can be made");
}

MemoryFile::~MemoryFile()
{
    ::close(m_descriptor);
}

void MemoryFile::write(const QByteArray& content)
{
    const bool written = ::ftruncate(m_descriptor, 0) == 0
                         && ::pwrite(m_descriptor, content.constData(), size_t(content.size()), 0) == content.size();
    check(written, "a file in memory can be written");
}

QString MemoryFile::folder()
{
    return QStringLiteral("/proc/self/fd");
}

QString MemoryFile::name() const
{
    return QString::number(m_descriptor);
}

} // namespace Fuzzing
