// SPDX-License-Identifier: MIT
#include "intenttable.h"

#include <algorithm>

IntentTable::IntentTable(const QVector<Entry>& entries, QObject* parent)
    : HmiIntentHandler(parent)
    , m_entries(entries)
{
    for (const Entry& entry : m_entries) {
        addAction(entry.intent);
        m_enabled.insert(entry.intent, IntentTable::isActionEnabled(entry.intent));
    }
}

const IntentTable::Entry* IntentTable::find(int intent) const
{
    const auto found = std::find_if(m_entries.cbegin(), m_entries.cend(),
                                    [intent](const Entry& entry) { return entry.intent == intent; });
    return found == m_entries.cend() ? nullptr : &*found;
}

bool IntentTable::performAction(int intent, const Data& data, bool, const QVariant&)
{
    const Entry* const entry = find(intent);
    if (!entry)
        return false;
    m_error = entry->obstacle ? entry->obstacle() : QString();
    if (m_error.isEmpty() && entry->problem)
        m_error = entry->problem(data);
    if (!m_error.isEmpty())
        return false;
    QMetaObject::invokeMethod(
        this, [entry, data] { entry->perform(data); }, Qt::QueuedConnection);
    return true;
}

bool IntentTable::isActionEnabled(int intent) const
{
    const Entry* const entry = find(intent);
    return entry && (!entry->obstacle || entry->obstacle().isEmpty());
}

void IntentTable::update()
{
    for (const Entry& entry : m_entries) {
        const bool enabled = isActionEnabled(entry.intent);
        if (enabled == m_enabled.value(entry.intent))
            continue;
        m_enabled.insert(entry.intent, enabled);
        Q_EMIT actionStatusChanged(entry.intent, enabled);
    }
}
