// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractListModel>
#include <QVector>

/// \brief The media library in an order to choose from. GUI thread only.
class LibraryModel : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(Order order READ order WRITE setOrder NOTIFY orderChanged)
    Q_PROPERTY(int count READ count NOTIFY countChanged)

public:
    enum Order { ByTitle, ByArtist, ByAlbum };
    Q_ENUM(Order)
    enum Role {
        Title = Qt::UserRole + 1,
        Detail,  ///< what the heading does not say already
        Section, ///< heading: first letter, artist or album
        Row,     ///< row in the player's library
    };

    explicit LibraryModel(QObject* parent);

    Order order() const { return m_order; }
    void setOrder(Order order);
    int count() const { return int(m_rows.size()); }

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

Q_SIGNALS:
    void orderChanged();
    void countChanged();

private:
    struct Entry
    {
        QString title;
        QString detail;
        QString section;
        int row;
    };

    void rebuild();

    Order m_order = ByTitle;
    QVector<Entry> m_rows;
};
