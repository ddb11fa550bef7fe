// SPDX-License-Identifier: MIT
#include "messagemodel.h"

#include <algorithm>

MessageModel::MessageModel(QObject* parent)
    : QAbstractListModel(parent)
{
}

int MessageModel::unreadCount() const
{
    return int(std::count_if(m_messages.cbegin(), m_messages.cend(), [](const Message& one) { return one.unread; }));
}

void MessageModel::add(const Message& message)
{
    if (count() == most)
        remove(count() - 1);
    beginInsertRows({}, 0, 0);
    m_messages.prepend(message);
    for (QString* const text : {&m_messages.first().sender, &m_messages.first().text})
        text->truncate(longestText);
    endInsertRows();
    Q_EMIT countChanged();
    Q_EMIT unreadCountChanged();
}

void MessageModel::replace(int row, const Message& message)
{
    m_messages[row] = message;
    Q_EMIT dataChanged(index(row), index(row));
    Q_EMIT unreadCountChanged();
}

void MessageModel::remove(int row)
{
    beginRemoveRows({}, row, row);
    m_messages.remove(row);
    endRemoveRows();
    Q_EMIT countChanged();
    Q_EMIT unreadCountChanged();
}

void MessageModel::retranslate()
{
    if (count() > 0)
        Q_EMIT dataChanged(index(0), index(count() - 1));
}

int MessageModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : count();
}

QVariant MessageModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    const Message& message = m_messages.at(index.row());
    switch (role) {
    case Sender:
        return message.shownSender();
    case Text:
        return message.shownText().section(QLatin1Char('\n'), 0, 0);
    case Time:
        return message.time;
    case Icon:
        return message.icon();
    case Unread:
        return message.unread;
    default:
        return {};
    }
}

QHash<int, QByteArray> MessageModel::roleNames() const
{
    return {{Sender, "sender"}, {Text, "text"}, {Time, "time"}, {Icon, "icon"}, {Unread, "unread"}};
}
