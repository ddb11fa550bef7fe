// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractListModel>
#include <QBasicTimer>
#include <QElapsedTimer>
#include <QList>
#include <QString>

namespace HmiVehicle {

/// \brief What happened last, newest at the end: keys sent, calls received, decisions reported. GUI thread only.
///
/// It keeps maximumEntries. New ones appear together a few times a second, so that a flood costs no more than that.
class Journal : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(int count READ count NOTIFY countChanged)

public:
    enum Kind { Key, Call, Decision };
    Q_ENUM(Kind)
    enum Role { TimeRole = Qt::UserRole + 1, KindRole, TextRole };

    static constexpr int maximumEntries = 500;
    static constexpr int longestText = 600; ///< longer ones are cut

    explicit Journal(QObject* parent = nullptr);

    /// \brief Adds an entry of now.
    void add(Kind kind, const QString& text);
    /// \brief Shows at once what was added.
    void flush();
    Q_INVOKABLE void clear();

    int count() const { return int(m_entries.size()); }
    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

Q_SIGNALS:
    void countChanged();

protected:
    void timerEvent(QTimerEvent* event) override;

private:
    struct Entry
    {
        double seconds;
        Kind kind;
        QString text;
    };

    QList<Entry> m_entries;
    QList<Entry> m_new;
    QBasicTimer m_timer;
    QElapsedTimer m_clock;
};

} // namespace HmiVehicle
