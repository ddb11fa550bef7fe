// SPDX-License-Identifier: MIT
#include "HmiVehicle/keymap.h"

#include "HmiVehicle/keycatalogue.h"
#include "HmiVehicle/keyinput.h"

#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonObject>

#include <libevdev/libevdev.h>

static void registerKeyMap()
{
    Q_INIT_RESOURCE(keymap); // a static library's resources are not registered by themselves
}

namespace HmiVehicle {

namespace {

constexpr qint64 maximumSize = 1024 * 1024;

/// Reads one member of the map: names of codes and of keys. Empty, or what is wrong with which field.
QString readCodes(const QJsonObject& document, const char* member, unsigned int type, QHash<unsigned int, int>* codes)
{
    const QString name = QLatin1String(member);
    const QJsonValue value = document.value(name);
    if (!value.isUndefined() && !value.isObject())
        return name + QStringLiteral(": not an object");
    const QJsonObject entries = value.toObject();
    for (auto entry = entries.constBegin(); entry != entries.constEnd(); ++entry) {
        const QString field = name + QLatin1Char('.') + entry.key().left(64) + QStringLiteral(": ");
        const int code = libevdev_event_code_from_name(type, entry.key().toLatin1().constData());
        const QString text =
            entry.value().isDouble() ? QString::number(entry.value().toDouble()) : entry.value().toString();
        const int key = KeyCatalogue::instance().idFrom(text);
        if (code < 0)
            return field + QStringLiteral("an input device has no such code");
        if (key < 0 || key > KeyInput::largestKey)
            return field + QStringLiteral("'%1' is neither the name nor the number of a key").arg(text.left(64));
        const KeyInfo* const info = KeyCatalogue::instance().find(key);
        if (type == EV_REL && (!info || !info->opposite))
            return field + QStringLiteral("'%1' cannot be turned both ways").arg(text.left(64));
        codes->insert(unsigned(code), key);
    }
    return QString();
}

} // namespace

KeyMap KeyMap::shipped()
{
    registerKeyMap();
    KeyMap map;
    if (!map.load(QStringLiteral(":/HmiVehicle/keymap.json")))
        qFatal("%s", qPrintable(map.errorString()));
    return map;
}

bool KeyMap::load(const QString& fileName)
{
    QFile file(fileName);
    const QFileInfo info(fileName);
    if (!info.isFile() || info.size() > maximumSize)
        m_error = fileName + QStringLiteral(": not a file that can be read");
    else if (!file.open(QIODevice::ReadOnly))
        m_error = fileName + QStringLiteral(": ") + file.errorString();
    else
        m_error = read(file.readAll());
    if (!m_error.isEmpty() && file.isOpen())
        m_error = fileName + m_error;
    return m_error.isEmpty();
}

QString KeyMap::read(const QByteArray& content)
{
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(content, &error);
    if (error.error != QJsonParseError::NoError)
        return QStringLiteral(":%1: %2").arg(content.left(error.offset).count('\n') + 1).arg(error.errorString());
    const QJsonObject object = document.object();
    KeyMap map;
    QString problem;
    const QStringList members = object.keys();
    for (const QString& member : members)
        if (member != QLatin1String("keys") && member != QLatin1String("dials") && member != QLatin1String("note"))
            problem = member.left(64) + QStringLiteral(": only 'keys', 'dials' and 'note' are known");
    if (problem.isEmpty())
        problem = readCodes(object, "keys", EV_KEY, &map.m_keys);
    if (problem.isEmpty())
        problem = readCodes(object, "dials", EV_REL, &map.m_dials);
    if (problem.isEmpty() && map.m_keys.isEmpty() && map.m_dials.isEmpty())
        problem = QStringLiteral("no keys in it");
    if (!problem.isEmpty())
        return QStringLiteral(": ") + problem;
    m_keys = map.m_keys;
    m_dials = map.m_dials;
    return QString();
}

} // namespace HmiVehicle
