// SPDX-License-Identifier: MIT
#include "destinationmodel.h"

#include "placecategories.h"
#include "units.h"

#include <QLineF>

#include <algorithm>

DestinationModel::DestinationModel(const Town& town, QObject* parent)
    : QAbstractListModel(parent)
    , m_town(town)
    , m_position(town.start)
{
    rebuild();
}

void DestinationModel::setCategory(int category)
{
    if (category == m_category || category < 0 || category >= PlaceCategories::count())
        return;
    m_category = category;
    rebuild();
    Q_EMIT categoryChanged();
}

QVariantList DestinationModel::categories() const
{
    QVariantList list;
    for (int row = 0; row < PlaceCategories::count(); ++row) {
        const auto& category = PlaceCategories::at(row);
        list.append(QVariantMap{{QStringLiteral("name"), PlaceCategories::name(category)},
                                {QStringLiteral("icon"), QString::fromLatin1(category.icon)}});
    }
    return list;
}

void DestinationModel::setPosition(const QPointF& position)
{
    m_position = position;
    rebuild();
}

void DestinationModel::retranslate()
{
    Q_EMIT categoriesChanged();
    if (!m_rows.isEmpty())
        Q_EMIT dataChanged(index(0), index(rowCount() - 1));
}

int DestinationModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_rows.size());
}

QVariant DestinationModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    const int row = m_rows.at(index.row());
    const Place& place = m_town.places.at(row);
    const auto& category = PlaceCategories::find(place.category);
    switch (role) {
    case Name:
        return place.name;
    case Kind:
        return PlaceCategories::name(category);
    case Icon:
        return QString::fromLatin1(category.icon);
    case Distance:
        return Units::distance(distanceTo(row));
    case PlaceRow:
        return row;
    default:
        return {};
    }
}

QHash<int, QByteArray> DestinationModel::roleNames() const
{
    return {{Name, "name"}, {Kind, "kind"}, {Icon, "icon"}, {Distance, "distance"}, {PlaceRow, "placeRow"}};
}

double DestinationModel::distanceTo(int row) const
{
    return QLineF(m_position, m_town.places.at(row).at).length();
}

void DestinationModel::rebuild()
{
    const QString wanted = QString::fromLatin1(PlaceCategories::at(m_category).id);
    beginResetModel();
    m_rows.clear();
    for (int row = 0; row < m_town.places.size(); ++row)
        if (wanted.isEmpty() || m_town.places.at(row).category == wanted)
            m_rows.append(row);
    std::stable_sort(m_rows.begin(), m_rows.end(),
                     [this](int left, int right) { return distanceTo(left) < distanceTo(right); });
    endResetModel();
}
