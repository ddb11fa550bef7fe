// SPDX-License-Identifier: MIT
#include "HmiVehicle/keycatalogue.h"

#include "resource.h"

#include <QJsonArray>
#include <QJsonObject>

#include <algorithm>

namespace HmiVehicle {

namespace {

QString textOf(const QJsonObject& object, const char* field)
{
    return object.value(QLatin1String(field)).toString();
}

int numberOf(const QJsonObject& object, const char* field, int otherwise = 0)
{
    return object.value(QLatin1String(field)).toInt(otherwise);
}

} // namespace

const KeyCatalogue& KeyCatalogue::instance()
{
    static const KeyCatalogue catalogue;
    return catalogue;
}

KeyCatalogue::KeyCatalogue()
{
    const QJsonObject document = readResource(QStringLiteral(":/HmiVehicle/keys.json"));
    m_longPress = numberOf(document, "longPress");
    const QJsonArray keys = document.value(QLatin1String("keys")).toArray();
    for (const auto& value : keys) {
        const QJsonObject key = value.toObject();
        const bool onWheel = textOf(key, "group") == QLatin1String("wheel");
        const bool isRotary = textOf(key, "kind") == QLatin1String("rotary");
        m_keys.append({numberOf(key, "id"), textOf(key, "name"), textOf(key, "text"),
                       onWheel ? KeyInfo::SteeringWheel : KeyInfo::FrontPanel,
                       isRotary ? KeyInfo::Rotary : KeyInfo::Button, numberOf(key, "opposite"),
                       numberOf(key, "longPress", m_longPress), numberOf(key, "repeat")});
    }
    const QJsonArray combinations = document.value(QLatin1String("combinations")).toArray();
    for (const auto& value : combinations) {
        const QJsonObject object = value.toObject();
        KeyCombination combination{numberOf(object, "id"),
                                   textOf(object, "name"),
                                   textOf(object, "text"),
                                   {},
                                   numberOf(object, "hold")};
        const QJsonArray names = object.value(QLatin1String("keys")).toArray();
        for (const auto& name : names)
            combination.keys.append(idFrom(name.toString()));
        m_combinations.append(combination);
    }
}

const KeyInfo* KeyCatalogue::find(int id) const
{
    const auto found = std::find_if(m_keys.cbegin(), m_keys.cend(), [id](const KeyInfo& key) { return key.id == id; });
    return found == m_keys.cend() ? nullptr : &*found;
}

const KeyInfo* KeyCatalogue::find(const QString& name) const
{
    const auto found =
        std::find_if(m_keys.cbegin(), m_keys.cend(), [&name](const KeyInfo& key) { return key.name == name; });
    return found == m_keys.cend() ? nullptr : &*found;
}

int KeyCatalogue::idFrom(const QString& text) const
{
    if (const KeyInfo* const key = find(text))
        return key->id;
    bool isNumber = false;
    const int id = text.toInt(&isNumber);
    return isNumber && id >= 0 ? id : -1;
}

} // namespace HmiVehicle
