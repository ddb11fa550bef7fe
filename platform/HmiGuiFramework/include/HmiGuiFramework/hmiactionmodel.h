// SPDX-License-Identifier: MIT
#pragma once

#include "hmiaction.h"
#include "hmiguiframework_export.h"

#include <QAbstractListModel>
#include <QPointer>
#include <QVector>

namespace HmiGuiFramework {

/// \brief A menu: a list of actions. Does not own them; a deleted action leaves the list. GUI thread only.
class HMIGUIFRAMEWORK_EXPORT HmiActionModel : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(int count READ count NOTIFY countChanged)

public:
    /// \brief Role numbers; the role names in QML are "action", "text", "icon" and "actionEnabled".
    enum Role { ActionRole = Qt::UserRole, TextRole, IconRole, EnabledRole };
    Q_ENUM(Role)

    explicit HmiActionModel(QObject* parent);
    ~HmiActionModel() override;

    /// \brief Appends an action; null and actions that are in the list already are ignored.
    void addChild(HmiAction* action);

    /// \brief Sorts by HmiAction::order; actions of one order keep their places among each other.
    void sortActions();

    int count() const { return int(m_actions.size()); } ///< of actions

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    QHash<int, QByteArray> roleNames() const override;

    /// \brief Triggers the action of a row; rows outside the list are ignored.
    Q_INVOKABLE void trigger(int row);

Q_SIGNALS:
    void countChanged();

private:
    void actionChanged(HmiAction* action, int role);
    void removeDeleted();

    QVector<QPointer<HmiAction>> m_actions; // null for an action that is just being deleted
};

} // namespace HmiGuiFramework
