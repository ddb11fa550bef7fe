// SPDX-License-Identifier: MIT
#pragma once

#include "town.h"

#include <QAbstractListModel>

/// \brief The places of the town of one category, the nearest first. GUI thread only.
class DestinationModel : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(int category READ category WRITE setCategory NOTIFY categoryChanged)
    Q_PROPERTY(QVariantList categories READ categories NOTIFY categoriesChanged)

public:
    enum Role {
        Name = Qt::UserRole + 1,
        Kind,     ///< the category in the language of the HMI
        Icon,     ///< of the category
        Distance, ///< as the crow flies, as text
        PlaceRow, ///< row in Town::places
    };

    DestinationModel(const Town& town, QObject* parent);

    int category() const { return m_category; } ///< row of categories()
    void setCategory(int category);
    QVariantList categories() const; ///< each with `name` and `icon`; the first stands for all

    /// \brief Measures from \a position from now on.
    void setPosition(const QPointF& position);
    /// \brief Asks for all texts again, in another language or unit.
    void retranslate();

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

Q_SIGNALS:
    void categoryChanged();
    void categoriesChanged();

private:
    double distanceTo(int row) const;
    void rebuild();

    const Town& m_town;
    QVector<int> m_rows;
    QPointF m_position;
    int m_category = 0;
};
