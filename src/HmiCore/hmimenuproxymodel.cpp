// SPDX-License-Identifier: MIT
#include "hmimenuproxymodel.h"

#include "hmimodulerootmodel.h"

namespace HmiCore {

HmiMenuProxyModel::HmiMenuProxyModel(QObject* parent)
    : QSortFilterProxyModel(parent)
{
}

HmiMenuProxyModel::~HmiMenuProxyModel() = default;

int HmiMenuProxyModel::domainForIndex(const QModelIndex& index) const
{
    return QSortFilterProxyModel::data(index, HmiModuleRootModel::ModuleDomain).toInt();
}

QVariant HmiMenuProxyModel::data(const QModelIndex& index, int role) const
{
    const QVariant value = proxyData(index, role, domainForIndex(index));
    return value.isValid() ? value : QSortFilterProxyModel::data(index, role);
}

QVariant HmiMenuProxyModel::proxyData(const QModelIndex& index, int role, int domain) const
{
    Q_UNUSED(index)
    Q_UNUSED(role)
    Q_UNUSED(domain)
    return {};
}

void HmiMenuProxyModel::reset()
{
    beginResetModel();
    endResetModel();
}

} // namespace HmiCore
