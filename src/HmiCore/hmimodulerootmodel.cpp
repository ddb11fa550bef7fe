// SPDX-License-Identifier: MIT
#include "hmimodulerootmodel.h"

#include "hmimoduleintegration.h"
#include "logcategories.h"

#include <algorithm>

namespace HmiCore {

HmiModuleRootModel::HmiModuleRootModel(QObject* parent)
    : QAbstractListModel(parent)
{
}

HmiModuleRootModel::~HmiModuleRootModel() = default;

void HmiModuleRootModel::append(HmiModuleIntegration* module)
{
    if (!module)
        return;
    if (module->enabled())
        insertAtEnd(module);
    connect(module, &HmiModuleIntegration::enabledChanged, this, &HmiModuleRootModel::moduleEnabledChanged);
    connect(module, &HmiModuleIntegration::iconUrlChanged, this, &HmiModuleRootModel::moduleIconChanged);
    connect(module, &HmiModuleIntegration::blockedChanged, this, &HmiModuleRootModel::moduleBlockedChanged);
}

int HmiModuleRootModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_modules.size());
}

QVariant HmiModuleRootModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid() || index.row() >= m_modules.size())
        return {};
    const HmiModuleIntegration* const module = m_modules.at(index.row());
    switch (role) {
    case ModuleName:
        return module->moduleName();
    case ModulePriority:
        return module->modulePriority();
    case ModuleRootView:
        return module->rootStateIdentifier();
    case IconUrl:
        return module->iconUrl();
    case ModuleId:
        return module->moduleId();
    case ModuleDomain:
        return module->moduleDomain();
    case ModuleBlocked:
        return module->blocked();
    default:
        return {};
    }
}

QHash<int, QByteArray> HmiModuleRootModel::roleNames() const
{
    QHash<int, QByteArray> names = QAbstractListModel::roleNames();
    names.insert(ModuleName, "moduleName");
    names.insert(ModulePriority, "modulePriority");
    names.insert(ModuleRootView, "moduleRootView");
    names.insert(IconUrl, "iconUrl");
    names.insert(ModuleId, "moduleId");
    names.insert(ModuleDomain, "moduleDomain");
    names.insert(ModuleBlocked, "moduleBlocked");
    return names;
}

bool HmiModuleRootModel::containsModule(int domain) const
{
    return std::any_of(m_modules.cbegin(), m_modules.cend(),
                       [domain](const HmiModuleIntegration* module) { return module->moduleDomain() == domain; });
}

QModelIndex HmiModuleRootModel::indexOf(QObject* object) const
{
    return index(int(m_modules.indexOf(qobject_cast<HmiModuleIntegration*>(object))), 0);
}

void HmiModuleRootModel::moduleEnabledChanged(bool enabled)
{
    auto* const module = qobject_cast<HmiModuleIntegration*>(sender());
    if (!module)
        return;
    const bool shown = m_modules.contains(module);
    if (enabled && !shown) {
        qCDebug(coreLog) << "Enabling:" << module->moduleName();
        insertAtEnd(module);
    } else if (!enabled && shown) {
        qCDebug(coreLog) << "Disabling:" << module->moduleName();
        beginResetModel(); // not a removal of rows: menus rebuild themselves from scratch when a module goes
        m_modules.removeAll(module);
        endResetModel();
    }
}

void HmiModuleRootModel::moduleIconChanged()
{
    announceSender(IconUrl);
}

void HmiModuleRootModel::moduleBlockedChanged()
{
    announceSender(ModuleBlocked);
}

void HmiModuleRootModel::insertAtEnd(HmiModuleIntegration* module)
{
    const int row = int(m_modules.size());
    beginInsertRows(QModelIndex(), row, row);
    m_modules.append(module);
    endInsertRows();
}

void HmiModuleRootModel::announceSender(int role)
{
    const QModelIndex changed = indexOf(sender());
    if (changed.isValid())
        Q_EMIT dataChanged(changed, changed, {role});
}

} // namespace HmiCore
