// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QAbstractListModel>
#include <QList>

namespace HmiCore {

class HmiModuleIntegration;

/// \brief The enabled root modules, in the order in which they were appended or enabled again. GUI thread only.
class HMICORE_EXPORT HmiModuleRootModel : public QAbstractListModel
{
    Q_OBJECT

public:
    /// \brief What data() answers; the role names in QML are those of the values with a small first letter.
    enum Role : int {
        ModuleName = Qt::UserRole, ///< "moduleName": string
        ModulePriority,            ///< "modulePriority": int
        ModuleRootView,            ///< "moduleRootView": name of the module's root state, string
        IconUrl,                   ///< "iconUrl": URL
        ModuleId,                  ///< "moduleId": string
        ModuleDomain,              ///< "moduleDomain": int
        ModuleBlocked,             ///< "moduleBlocked": bool
    };

    explicit HmiModuleRootModel(QObject* parent);
    ~HmiModuleRootModel() override;

    /// \brief Adds a module as the last row, or, when it is disabled, as soon as it is enabled.
    ///
    /// The model does not own the module, which must outlive it. Null is ignored.
    void append(HmiModuleIntegration* module);

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    QHash<int, QByteArray> roleNames() const override;

    /// \brief Whether a shown module has this domain. Disabled modules are not found.
    Q_INVOKABLE bool containsModule(int domain) const;

    /// \brief The index of a module's first row; invalid when \a object is not shown or not a module.
    QModelIndex indexOf(QObject* object) const;

private Q_SLOTS:
    void moduleEnabledChanged(bool enabled);
    void moduleIconChanged();
    void moduleBlockedChanged();

private:
    void insertAtEnd(HmiModuleIntegration* module);
    void announceSender(int role);

    QList<HmiModuleIntegration*> m_modules;
};

} // namespace HmiCore
