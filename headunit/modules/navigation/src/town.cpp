// SPDX-License-Identifier: MIT
#include "town.h"

#include "datafile.h"

#include <QHash>
#include <QJsonArray>
#include <QJsonObject>

#include <cmath>

namespace {

constexpr double farthest = 1e7; ///< metres from the corner; more than any town, and what a whole number holds

/// Reads the fields of a town and remembers the first that is wrong.
class TownReader
{
public:
    QString error;

    void read(const QJsonObject& object, Town* town)
    {
        town->name = object.value(QLatin1String("name")).toString();
        const QJsonObject start = object.value(QLatin1String("start")).toObject();
        town->start = point(start.value(QLatin1String("at")), QStringLiteral("start.at"));
        town->heading = start.value(QLatin1String("heading")).toDouble();
        each(object, QStringLiteral("areas"), [&](const QJsonObject& area, const QString& where) {
            static const QHash<QString, AreaKind> kinds{{QStringLiteral("town"), AreaKind::Built},
                                                        {QStringLiteral("park"), AreaKind::Park},
                                                        {QStringLiteral("water"), AreaKind::Water}};
            town->areas.append(
                {oneOf(kinds, area, QStringLiteral("kind"), where), nameOf(area), points(area, where, 3)});
        });
        each(object, QStringLiteral("streets"), [&](const QJsonObject& street, const QString& where) {
            static const QHash<QString, StreetClass> classes{{QStringLiteral("minor"), StreetClass::Minor},
                                                             {QStringLiteral("main"), StreetClass::Main},
                                                             {QStringLiteral("motorway"), StreetClass::Motorway}};
            town->streets.append(
                {nameOf(street), oneOf(classes, street, QStringLiteral("class"), where), points(street, where, 2)});
            town->bounds |= town->streets.constLast().points.boundingRect();
        });
        each(object, QStringLiteral("places"), [&](const QJsonObject& place, const QString& where) {
            town->places.append({nameOf(place), place.value(QLatin1String("category")).toString(),
                                 point(place.value(QLatin1String("at")), where + QStringLiteral(".at"))});
        });
        if (town->streets.isEmpty())
            fail(QStringLiteral("streets"), QStringLiteral("there are none"));
    }

private:
    void fail(const QString& where, const QString& what)
    {
        if (error.isEmpty())
            error = QStringLiteral("%1: %2").arg(where, what);
    }

    template <typename Reader>
    void each(const QJsonObject& object, const QString& field, Reader reader)
    {
        const QJsonArray list = object.value(field).toArray();
        for (int i = 0; i < list.size(); ++i)
            reader(list.at(i).toObject(), QStringLiteral("%1[%2]").arg(field).arg(i));
    }

    static QString nameOf(const QJsonObject& object) { return object.value(QLatin1String("name")).toString(); }

    template <typename Value>
    Value oneOf(const QHash<QString, Value>& values, const QJsonObject& object, const QString& field,
                const QString& where)
    {
        const QString word = object.value(field).toString();
        if (!values.contains(word))
            fail(where + QLatin1Char('.') + field, QStringLiteral("'%1' is not known").arg(word.left(64)));
        return values.value(word);
    }

    QPointF point(const QJsonValue& value, const QString& where)
    {
        const QJsonArray pair = value.toArray();
        if (pair.size() != 2 || !pair.at(0).isDouble() || !pair.at(1).isDouble())
            fail(where, QStringLiteral("is no pair of metres"));
        const QPointF point(pair.at(0).toDouble(), pair.at(1).toDouble());
        if (!(std::abs(point.x()) <= farthest && std::abs(point.y()) <= farthest))
            fail(where, QStringLiteral("is too far away"));
        return point;
    }

    QPolygonF points(const QJsonObject& object, const QString& where, int fewest)
    {
        const QJsonArray list = object.value(QLatin1String("points")).toArray();
        if (list.size() < fewest)
            fail(where + QStringLiteral(".points"), QStringLiteral("has fewer than %1").arg(fewest));
        QPolygonF result;
        for (int i = 0; i < list.size(); ++i)
            result.append(point(list.at(i), QStringLiteral("%1.points[%2]").arg(where).arg(i)));
        return result;
    }
};

} // namespace

std::shared_ptr<const Town> Town::load(const QString& fileName, QString* error)
{
    const QJsonObject object = DataFile::read(fileName, error);
    if (!error->isEmpty())
        return nullptr;
    TownReader reader;
    const auto town = std::make_shared<Town>();
    reader.read(object, town.get());
    if (reader.error.isEmpty())
        return town;
    *error = QStringLiteral("%1: %2").arg(fileName, reader.error);
    return nullptr;
}
