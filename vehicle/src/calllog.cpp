// SPDX-License-Identifier: MIT
#include "calllog.h"

#include <QJsonDocument>
#include <QJsonObject>

namespace HmiVehicle {

namespace {
constexpr size_t maximumCalls = 10000;
} // namespace

void CallLog::add(const QByteArray& line)
{
    const QJsonObject call = QJsonDocument::fromJson(line).object();
    const QString source = call.value(QLatin1String("source")).toString();
    const QString name = call.value(QLatin1String("call")).toString();
    // That is talk about the HMI, nothing that it wants of the vehicle: what it decided can be expected, but need not.
    const bool isTalk = source == QLatin1String("DeveloperSource");
    if (isTalk && name != QLatin1String("reportDecision"))
        return;
    m_calls.push_back({source, name, call.value(QLatin1String("args")).toArray(), isTalk});
    if (m_calls.size() > maximumCalls) {
        m_calls.pop_front();
        m_next -= m_next > 0;
    }
    Q_EMIT grown();
}

bool CallLog::take(const Expectation& expectation)
{
    for (size_t i = m_next; i < m_calls.size(); ++i) {
        if (!expectation.matches(m_calls[i].source, m_calls[i].name, m_calls[i].arguments))
            continue;
        m_calls[i].taken = true;
        m_next = i + 1;
        return true;
    }
    return false;
}

QStringList CallLog::sinceTaken() const
{
    QStringList calls;
    for (size_t i = m_next; i < m_calls.size(); ++i)
        if (!m_calls[i].isTalk)
            calls.append(callText(m_calls[i].source, m_calls[i].name, m_calls[i].arguments));
    return calls;
}

QStringList CallLog::leftOver() const
{
    QStringList calls;
    for (const Call& call : m_calls)
        if (!call.taken && !call.isTalk)
            calls.append(callText(call.source, call.name, call.arguments));
    return calls;
}

void CallLog::forget()
{
    m_calls.clear();
    m_next = 0;
}

} // namespace HmiVehicle
