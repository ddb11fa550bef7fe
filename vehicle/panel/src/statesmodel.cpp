// SPDX-License-Identifier: MIT
#include "statesmodel.h"

#include <utility>

namespace HmiVehicle {

namespace {

QString member(const QJsonValue& object, const char* name)
{
    return object.toObject().value(QLatin1String(name)).toString();
}

QVariantList choicesOf(const QJsonValue& row)
{
    QVariantList choices;
    const QJsonArray list = row.toObject().value(QLatin1String("choices")).toArray();
    for (const QJsonValue& choice : list)
        choices.append(QVariantMap{{QStringLiteral("text"), choice.toArray().at(0).toString()},
                                   {QStringLiteral("number"), choice.toArray().at(1).toInt()}});
    return choices;
}

} // namespace

StatesModel::StatesModel(const QJsonArray& sections, const Read& read, Write write, QObject* parent)
    : QAbstractListModel(parent)
    , m_write(std::move(write))
{
    for (const QJsonValue& section : sections) {
        const QJsonArray rows = section.toObject().value(QLatin1String("rows")).toArray();
        for (const QJsonValue& row : rows) {
            const QString source = member(row, "source");
            const QString field = member(row, "field");
            m_rows.append({member(section, "title"), member(row, "text"), source, field, choicesOf(row),
                           read(source).value(field)});
        }
    }
}

bool StatesModel::set(int row, int value)
{
    if (row < 0 || row >= m_rows.size())
        return false;
    const Row& target = m_rows.at(row);
    return m_write(target.source, target.field, target.value.isBool() ? QJsonValue(value != 0) : QJsonValue(value));
}

void StatesModel::update(const QString& source, const QJsonObject& changes)
{
    for (int row = 0; row < m_rows.size(); ++row) {
        if (m_rows.at(row).source != source || !changes.contains(m_rows.at(row).field))
            continue;
        m_rows[row].value = changes.value(m_rows.at(row).field);
        Q_EMIT dataChanged(index(row), index(row), {ValueRole});
    }
}

int StatesModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_rows.size());
}

QVariant StatesModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return QVariant();
    const Row& row = m_rows.at(index.row());
    switch (role) {
    case SectionRole:
        return row.section;
    case TextRole:
        return row.text;
    case NameRole:
        return row.source + QLatin1Char('.') + row.field;
    case ChoicesRole:
        return row.choices;
    case ValueRole:
        return row.value.isBool() ? int(row.value.toBool()) : row.value.toInt();
    default:
        return QVariant();
    }
}

QHash<int, QByteArray> StatesModel::roleNames() const
{
    return {{SectionRole, "section"},
            {TextRole, "text"},
            {NameRole, "name"},
            {ChoicesRole, "choices"},
            {ValueRole, "value"}};
}

} // namespace HmiVehicle
