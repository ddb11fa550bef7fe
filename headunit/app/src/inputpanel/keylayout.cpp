// SPDX-License-Identifier: MIT
#include "keylayout.h"

#include "datafile.h"

#include <HmiCore/HmiComplexKeyboard>
#include <HmiCore/HmiHandwriting>

#include <QJsonArray>
#include <QJsonObject>
#include <QMetaEnum>

#include <algorithm>
#include <iterator>

using HmiCore::HmiComplexKeyboard;
using HmiCore::HmiHandwriting;

namespace {

const QString space = QStringLiteral("space");

struct Action
{
    const char* name;
    const char* icon;
    double width; ///< in keys that type
};

constexpr Action actions[] = {
    {"shift", "shift", 1.4}, {"backspace", "backspace", 1.4}, {"symbols", "", 1.4},
    {"letters", "", 1.4},    {"layout", "language", 1},       {"writing", "pen", 1},
    {"keys", "keyboard", 1}, {"hide", "keyboard-hide", 1},    {"enter", "enter", 1.6},
    {"space", "", 4},
};

const Action* find(const QString& name)
{
    const auto* const found = std::find_if(std::begin(actions), std::end(actions), [&name](const Action& action) {
        return name == QLatin1String(action.name);
    });
    return found == std::end(actions) ? nullptr : found;
}

/// The capital of ß is two letters, or one that hardly anybody reads.
QString capital(const QString& small)
{
    const QString upper = small.toUpper();
    return upper.size() == small.size() ? upper : small;
}

QStringList words(const QString& text)
{
    return text.split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

/// Reads a layout's fields, and keeps what was wrong first.
class Reader
{
public:
    explicit Reader(const QString& file)
        : m_file(file)
    {
    }

    QJsonObject open() { return DataFile::read(m_file, &m_error); }

    QString text(const QJsonObject& object, const QString& field)
    {
        const QJsonValue value = object.value(field);
        if (!value.isString() || value.toString().isEmpty())
            fail(field, QStringLiteral("must be a text"));
        return value.toString();
    }

    template <typename Owner>
    int language(const QJsonObject& object, const QString& field)
    {
        if (!object.contains(field))
            return Owner::Invalid;
        bool known = false;
        const int number = QMetaEnum::fromType<typename Owner::Language>().keyToValue(
            object.value(field).toString().toLatin1().constData(), &known);
        if (!known)
            fail(field, QStringLiteral("is no language"));
        return number;
    }

    QStringList keysThatAct(const QJsonObject& row, const QString& field)
    {
        QStringList names;
        const QJsonArray array = row.value(field).toArray();
        for (const QJsonValue& value : array) {
            if (!find(value.toString()))
                fail(field, QStringLiteral("\"%1\" is no key").arg(value.toString()));
            names.append(value.toString());
        }
        return names;
    }

    void fail(const QString& field, const QString& reason)
    {
        if (m_error.isEmpty())
            m_error = field.isEmpty() ? QStringLiteral("%1: %2").arg(m_file, reason)
                                      : QStringLiteral("%1: %2: %3").arg(m_file, field, reason);
    }

    QString error() const { return m_error; }

private:
    const QString m_file;
    QString m_error;
};

} // namespace

std::optional<KeyLayout> KeyLayout::read(const QString& file, QString* error)
{
    Reader reader(file);
    const QJsonObject object = reader.open();
    KeyLayout layout;
    layout.name = reader.text(object, QStringLiteral("name"));
    layout.title = reader.text(object, QStringLiteral("title"));
    layout.engine = reader.language<HmiComplexKeyboard>(object, QStringLiteral("engine"));
    layout.handwriting = reader.language<HmiHandwriting>(object, QStringLiteral("handwriting"));
    const QJsonArray rows = object.value(QStringLiteral("rows")).toArray();
    for (const QJsonValue& value : rows) {
        const QJsonObject row = value.toObject();
        layout.m_rows.append({reader.keysThatAct(row, QStringLiteral("before")),
                              words(reader.text(row, QStringLiteral("keys"))),
                              reader.keysThatAct(row, QStringLiteral("after"))});
    }
    if (rows.isEmpty())
        reader.fail(QStringLiteral("rows"), QStringLiteral("must not be empty"));
    const QJsonObject more = object.value(QStringLiteral("more")).toObject();
    for (auto text = more.begin(); text != more.end(); ++text)
        layout.m_more.insert(text.key(), words(text.value().toString()));
    *error = reader.error();
    return error->isEmpty() ? std::make_optional(layout) : std::nullopt;
}

QVariantList KeyLayout::rows(bool mirrored) const
{
    QVariantList all;
    for (const Row& row : m_rows) {
        QStringList before = mirrored ? row.after : row.before;
        QStringList after = mirrored ? row.before : row.after;
        if (mirrored) {
            std::reverse(before.begin(), before.end());
            std::reverse(after.begin(), after.end());
        }
        QVariantList keys;
        for (const QString& action : std::as_const(before))
            keys.append(acting(action));
        for (const QString& text : row.texts)
            keys.append(text == space ? acting(text) : typing(text));
        for (const QString& action : std::as_const(after))
            keys.append(acting(action));
        all.append(QVariant(keys));
    }
    return all;
}

QVariantMap KeyLayout::typing(const QString& text) const
{
    const QStringList more = m_more.value(text);
    QStringList moreCapital;
    std::transform(more.cbegin(), more.cend(), std::back_inserter(moreCapital), capital);
    return {{QStringLiteral("text"), text},        {QStringLiteral("capital"), capital(text)},
            {QStringLiteral("more"), more},        {QStringLiteral("moreCapital"), moreCapital},
            {QStringLiteral("action"), QString()}, {QStringLiteral("icon"), QString()},
            {QStringLiteral("width"), 1.0}};
}

QVariantMap KeyLayout::acting(const QString& name) const
{
    const Action& action = *find(name);
    return {{QStringLiteral("action"), name},
            {QStringLiteral("icon"), QString::fromLatin1(action.icon)},
            {QStringLiteral("width"), action.width}};
}
