// SPDX-License-Identifier: MIT
#pragma once

#include "message.h"

#include <QAbstractListModel>
#include <QVector>

/// \brief All messages, the newest first. Keeps the last hundred, until the head unit is switched off. GUI thread only.
class MessageModel : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(int count READ count NOTIFY countChanged)
    Q_PROPERTY(int unreadCount READ unreadCount NOTIFY unreadCountChanged)

public:
    enum Role {
        Sender = Qt::UserRole + 1,
        Text,
        Time, ///< hours and minutes, as the vehicle tells them
        Icon,
        Unread,
    };

    static constexpr int most = 100;
    static constexpr int longestText = 1000; ///< characters; the rest is left out

    explicit MessageModel(QObject* parent);

    int count() const { return int(m_messages.size()); }
    int unreadCount() const;
    const Message& at(int row) const { return m_messages.at(row); }

    /// \brief Puts a message before all others; the oldest goes when there are too many.
    void add(const Message& message);
    /// \brief Takes \a message for the one in \a row.
    void replace(int row, const Message& message);
    void remove(int row);
    /// \brief Asks for all texts again, in another language.
    void retranslate();

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

Q_SIGNALS:
    void countChanged();
    void unreadCountChanged();

private:
    QVector<Message> m_messages;
};
