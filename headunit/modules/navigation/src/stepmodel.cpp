// SPDX-License-Identifier: MIT
#include "stepmodel.h"

#include "manoeuvres.h"
#include "units.h"

#include <algorithm>

StepModel::StepModel(QObject* parent)
    : QAbstractListModel(parent)
{
}

void StepModel::setSteps(const QVector<RouteStep>& steps)
{
    beginResetModel();
    m_steps = steps;
    m_first = 0;
    m_driven = 0;
    endResetModel();
}

void StepModel::moveTo(int next, double metres)
{
    m_driven = metres;
    const int first = std::clamp(next, m_first, int(m_steps.size()));
    if (first > m_first) {
        beginRemoveRows({}, 0, first - m_first - 1);
        m_first = first;
        endRemoveRows();
    }
    if (rowCount() > 0)
        Q_EMIT dataChanged(index(0), index(0), {Distance});
}

void StepModel::retranslate()
{
    if (rowCount() > 0)
        Q_EMIT dataChanged(index(0), index(rowCount() - 1));
}

int StepModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_steps.size()) - m_first;
}

QVariant StepModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    const int row = m_first + index.row();
    const RouteStep& step = m_steps.at(row);
    switch (role) {
    case Icon:
        return Manoeuvres::icon(step.manoeuvre);
    case Instruction:
        return Manoeuvres::text(step.manoeuvre);
    case StreetName:
        return step.street;
    case Distance:
        return Units::distance(step.at - (index.row() > 0 ? m_steps.at(row - 1).at : m_driven));
    default:
        return {};
    }
}

QHash<int, QByteArray> StepModel::roleNames() const
{
    return {{Icon, "icon"}, {Instruction, "instruction"}, {StreetName, "street"}, {Distance, "distance"}};
}
