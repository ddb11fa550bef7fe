// SPDX-License-Identifier: MIT
#include "journal.h"

#include <QTimerEvent>

namespace HmiVehicle {

namespace {
constexpr int showAfter = 50; ///< milliseconds
}

Journal::Journal(QObject* parent)
    : QAbstractListModel(parent)
{
    m_clock.start();
}

void Journal::add(Kind kind, const QString& text)
{
    if (m_new.size() >= maximumEntries)
        m_new.removeFirst();
    m_new.append({double(m_clock.elapsed()) / 1000, kind, text.left(longestText)});
    if (!m_timer.isActive())
        m_timer.start(showAfter, this);
}

void Journal::flush()
{
    m_timer.stop();
    const int excess = count() + int(m_new.size()) - maximumEntries;
    if (excess > 0) {
        const int removed = qMin(excess, count());
        beginRemoveRows(QModelIndex(), 0, removed - 1);
        m_entries.erase(m_entries.begin(), m_entries.begin() + removed);
        endRemoveRows();
    }
    if (m_new.isEmpty())
        return;
    beginInsertRows(QModelIndex(), count(), count() + int(m_new.size()) - 1);
    m_entries += m_new;
    m_new.clear();
    endInsertRows();
    Q_EMIT countChanged();
}

void Journal::clear()
{
    beginResetModel();
    m_entries.clear();
    m_new.clear();
    endResetModel();
    Q_EMIT countChanged();
}

int Journal::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : count();
}

QVariant Journal::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return QVariant();
    const Entry& entry = m_entries.at(index.row());
    switch (role) {
    case TimeRole:
        return QString::number(entry.seconds, 'f', 2);
    case KindRole:
        return entry.kind;
    case TextRole:
        return entry.text;
    default:
        return QVariant();
    }
}

QHash<int, QByteArray> Journal::roleNames() const
{
    return {{TimeRole, "time"}, {KindRole, "kind"}, {TextRole, "text"}};
}

void Journal::timerEvent(QTimerEvent* event)
{
    if (event->timerId() == m_timer.timerId())
        flush();
}

} // namespace HmiVehicle
