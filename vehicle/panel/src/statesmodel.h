// SPDX-License-Identifier: MIT
#pragma once

#include <QAbstractListModel>
#include <QJsonArray>
#include <QJsonObject>
#include <QJsonValue>
#include <QList>
#include <QString>
#include <QVariant>

#include <functional>

namespace HmiVehicle {

/// \brief The switches of the panel: one row for each field of a source that the panel's table lists. GUI thread only.
class StatesModel : public QAbstractListModel
{
    Q_OBJECT

public:
    enum Role { SectionRole = Qt::UserRole + 1, TextRole, NameRole, ChoicesRole, ValueRole };

    using Read = std::function<QJsonObject(const QString& source)>;
    using Write = std::function<bool(const QString& source, const QString& field, const QJsonValue& value)>;

    /// \brief \a sections are those of the table; \a read gives the state of a source, \a write sets a field of one.
    StatesModel(const QJsonArray& sections, const Read& read, Write write, QObject* parent = nullptr);

    /// \brief Sets the field of a row: a number, which is on (1) and off (0) for a switch. False when the vehicle refused.
    Q_INVOKABLE bool set(int row, int value);

    /// \brief Shows what changed in a source.
    void update(const QString& source, const QJsonObject& changes);

    int rowCount(const QModelIndex& parent = QModelIndex()) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

private:
    struct Row
    {
        QString section;
        QString text;
        QString source;
        QString field;
        QVariantList choices; ///< texts and numbers; empty for a switch
        QJsonValue value;
    };

    const Write m_write;
    QList<Row> m_rows;
};

} // namespace HmiVehicle
