// SPDX-License-Identifier: MIT
#include "startuptimeline.h"

void StartupTimeline::endPhase(const QString& name, qint64 at)
{
    m_spans.append({name, m_phaseBegin, at, false});
    m_phaseBegin = m_stepBegin = at;
}

void StartupTimeline::endStep(const QString& name, qint64 at)
{
    m_spans.append({name, m_stepBegin, at, true});
    m_stepBegin = at;
}
