// SPDX-License-Identifier: MIT
#pragma once

#include "hmicore_export.h"

#include <QSortFilterProxyModel>

namespace HmiCore {

/// \brief The module model as the main menu shows it; a product may change single values of single modules.
///
/// Derive from it, override proxyData() and return the object from HmiInitializer::createMenuProxyModel(). The
/// initializer sets source model and sort order. GUI thread only.
class HMICORE_EXPORT HmiMenuProxyModel : public QSortFilterProxyModel
{
    Q_OBJECT

public:
    explicit HmiMenuProxyModel(QObject* parent);
    ~HmiMenuProxyModel() override;

    /// \brief The domain of the module at \a index; 0 when there is none.
    int domainForIndex(const QModelIndex& index) const;

    /// \brief proxyData() when it is valid, otherwise the value of the source model.
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;

    /// \brief The value to show instead of the module's own; an invalid one, as here, keeps the module's own.
    ///
    /// Called for every role of every row; \a domain is that of the module at \a index. Call reset() when answers change.
    virtual QVariant proxyData(const QModelIndex& index, int role, int domain) const;

public Q_SLOTS:
    /// \brief Makes views read all rows again.
    void reset();
};

} // namespace HmiCore
