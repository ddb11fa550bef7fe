// SPDX-License-Identifier: MIT
#include "decision.h"

#include "logcategories.h"

namespace HmiCore {

namespace {
constexpr int longestNote = 120; ///< texts come from modules
}

struct Decision::Line
{
    QElapsedTimer clock;
    QString subject;
    QStringList steps;
    QStringList seen;
    QString outcome;
};

Decision::Decision()
{
    if (Q_LIKELY(!decisionsLog().isDebugEnabled()))
        return;
    m_line = std::make_unique<Line>();
    m_line->clock.start();
}

Decision::~Decision()
{
    if (Q_LIKELY(!m_line))
        return;
    const double microseconds = double(m_line->clock.nsecsElapsed()) / 1000;
    QString text = m_line->subject + QLatin1String(": ")
                   + (m_line->outcome.isEmpty() ? QStringLiteral("nothing") : m_line->outcome);
    if (!m_line->steps.isEmpty())
        text += QLatin1String("; ") + m_line->steps.join(QLatin1String(", "));
    if (!m_line->seen.isEmpty())
        text += QLatin1String("; saw ") + m_line->seen.join(QLatin1Char(' '));
    qCDebug(decisionsLog).noquote() << QStringLiteral("%1; %2 us").arg(text).arg(microseconds, 0, 'f', 1);
}

void Decision::begin(const QString& subject)
{
    if (m_line)
        m_line->subject = subject;
}

void Decision::note(const char* text)
{
    if (m_line)
        m_line->steps.append(QString::fromUtf8(text));
}

void Decision::note(const QString& text)
{
    if (m_line)
        m_line->steps.append(text.left(longestNote).simplified());
}

void Decision::saw(const char* what, int value)
{
    if (!m_line)
        return;
    const QString text = QStringLiteral("%1=%2").arg(QLatin1String(what)).arg(value);
    if (!m_line->seen.contains(text))
        m_line->seen.append(text);
}

void Decision::conclude(const char* outcome)
{
    if (!m_line)
        return;
    if (!m_line->outcome.isEmpty())
        m_line->outcome += QLatin1String(" -> ");
    m_line->outcome += QString::fromUtf8(outcome);
}

} // namespace HmiCore
