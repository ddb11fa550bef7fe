// SPDX-License-Identifier: MIT
#include "hmiactionmodel.h"

#include <algorithm>

namespace HmiGuiFramework {

HmiActionModel::HmiActionModel(QObject* parent)
    : QAbstractListModel(parent)
{
}

HmiActionModel::~HmiActionModel() = default;

void HmiActionModel::addChild(HmiAction* action)
{
    if (!action || m_actions.contains(action))
        return;
    beginInsertRows(QModelIndex(), count(), count());
    m_actions.append(action);
    endInsertRows();
    connect(action, &HmiAction::textChanged, this, [this, action] { actionChanged(action, TextRole); });
    connect(action, &HmiAction::iconChanged, this, [this, action] { actionChanged(action, IconRole); });
    connect(action, &HmiAction::enabledChanged, this, [this, action] { actionChanged(action, EnabledRole); });
    connect(action, &QObject::destroyed, this, &HmiActionModel::removeDeleted);
    Q_EMIT countChanged();
}

void HmiActionModel::sortActions()
{
    beginResetModel();
    std::stable_sort(
        m_actions.begin(), m_actions.end(),
        [](const QPointer<HmiAction>& a, const QPointer<HmiAction>& b) { return a->order() < b->order(); });
    endResetModel();
}

int HmiActionModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : count();
}

QVariant HmiActionModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid | CheckIndexOption::ParentIsInvalid))
        return QVariant();
    HmiAction* const action = m_actions.at(index.row());
    if (!action)
        return QVariant();
    switch (role) {
    case ActionRole:
        return QVariant::fromValue(action);
    case Qt::DisplayRole:
    case TextRole:
        return action->text();
    case IconRole:
        return action->icon();
    case EnabledRole:
        return action->isEnabled();
    default:
        return QVariant();
    }
}

QHash<int, QByteArray> HmiActionModel::roleNames() const
{
    auto names = QAbstractListModel::roleNames();
    names.insert(ActionRole, "action");
    names.insert(TextRole, "text");
    names.insert(IconRole, "icon");
    names.insert(EnabledRole, "actionEnabled");
    return names;
}

void HmiActionModel::trigger(int row)
{
    if (row >= 0 && row < count() && m_actions.at(row))
        m_actions.at(row)->trigger();
}

void HmiActionModel::actionChanged(HmiAction* action, int role)
{
    const QModelIndex changed = index(int(m_actions.indexOf(action)));
    QVector<int> roles{role};
    if (role == TextRole)
        roles.append(Qt::DisplayRole);
    Q_EMIT dataChanged(changed, changed, roles);
}

void HmiActionModel::removeDeleted()
{
    const int row = int(m_actions.indexOf(QPointer<HmiAction>()));
    if (row < 0)
        return;
    beginRemoveRows(QModelIndex(), row, row);
    m_actions.remove(row);
    endRemoveRows();
    Q_EMIT countChanged();
}

} // namespace HmiGuiFramework
