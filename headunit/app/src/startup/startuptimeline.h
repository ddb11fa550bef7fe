// SPDX-License-Identifier: MIT
#pragma once

#include <QString>
#include <QVector>

/// \brief The phases of a start-up, one after the other without gaps, and steps within them.
class StartupTimeline
{
public:
    struct Span
    {
        QString name;
        qint64 begin; ///< ns since the start of the process
        qint64 end;   ///< ns
        bool isStep;  ///< within the phase that follows it in the list
    };

    /// A phase ends \a at, which is not before the end of any other; it began where the last phase ended.
    void endPhase(const QString& name, qint64 at);

    /// A step ends \a at; it began where the last phase or step ended.
    void endStep(const QString& name, qint64 at);

    /// In the order of their ends: the steps of a phase come before it.
    const QVector<Span>& spans() const { return m_spans; }

    /// Where the last phase ended, ns.
    qint64 duration() const { return m_phaseBegin; }

private:
    QVector<Span> m_spans;
    qint64 m_phaseBegin = 0;
    qint64 m_stepBegin = 0;
};
