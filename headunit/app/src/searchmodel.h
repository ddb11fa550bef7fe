// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractListModel>
#include <QVector>

class Market;

/// \brief Contacts of the phone and stations that can be received, by name. GUI thread only.
///
/// Case and accents do not count. First come names that begin with what is searched for, then those of which a word does, then those that
/// have it anywhere; digits find numbers too.
class SearchModel : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(QString query READ query WRITE setQuery NOTIFY queryChanged)
    Q_PROPERTY(int count READ count NOTIFY countChanged)

public:
    enum Role {
        Name = Qt::UserRole + 1,
        Detail, ///< number, or band and frequency
        Icon,
        Station, ///< it is one, not a contact
    };

    /// \brief Stations are those of the bands that \a market, which outlives it, offers.
    SearchModel(const Market& market, QObject* parent);

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

    QString query() const { return m_query; }
    int count() const { return int(m_found.size()); }
    void setQuery(const QString& query); ///< empty finds nothing

    /// \brief Calls the contact, or makes the station heard. Other rows than those there are do nothing.
    Q_INVOKABLE void use(int row);

Q_SIGNALS:
    void queryChanged();
    void countChanged();

private:
    struct Found
    {
        QString name;
        QString detail;
        QString target;  ///< number of a contact
        int band = -1;   ///< of a station; a contact has none
        int station = 0; ///< row in the band's list
        int rank = 0;
    };

    QVector<Found> search() const;
    void update();

    const Market& m_market;
    QString m_query;
    QVector<Found> m_found;
};
