// SPDX-License-Identifier: MIT
#include "descriptorparser.h"

#include "jsonfile.h"
#include "transitionmanager.h"

#include <QFile>
#include <QJsonArray>
#include <QSet>

#include <functional>

namespace HmiGuiFramework {

namespace {

constexpr int formatVersion = 1;
constexpr int nameLimit = 128;
constexpr int defaultTransientTime = 3000; // ms
constexpr int longestTime = 3600 * 1000;   // ms

/// The folder of the descriptor, as a base for the URLs in it.
QUrl baseUrlOf(const QString& path)
{
    return path.startsWith(QLatin1Char(':')) ? QUrl(QStringLiteral("qrc") + path) : QUrl::fromLocalFile(path);
}

bool exists(const QUrl& url)
{
    if (url.scheme() == QLatin1String("qrc"))
        return QFile::exists(QLatin1Char(':') + url.path());
    return !url.isLocalFile() || QFile::exists(url.toLocalFile());
}

/// Reads the fields of one JSON object and keeps the errors. A field that was not asked for is an error at the end.
class Fields
{
public:
    Fields(const QJsonObject& object, const QString& where, const QUrl& base, QStringList* errors)
        : m_object(object)
        , m_where(where)
        , m_base(base)
        , m_errors(errors)
        , m_errorsBefore(int(errors->size()))
    {
    }

    QString name(const char* field)
    {
        const QString text = string(field, true);
        if (text.size() > nameLimit)
            error(field, QStringLiteral("is longer than %1 characters").arg(nameLimit));
        else if (hasNoErrors() && text.isEmpty())
            error(field, QStringLiteral("must not be empty"));
        return text;
    }

    QString string(const char* field, bool required)
    {
        const QJsonValue value = take(field);
        if (value.isUndefined() && !required)
            return QString();
        if (!value.isString())
            error(field, value.isUndefined() ? QStringLiteral("is missing") : QStringLiteral("must be a string"));
        return value.toString();
    }

    int integer(const char* field, int minimum, int maximum, int otherwise)
    {
        const QJsonValue value = take(field);
        if (value.isUndefined())
            return otherwise;
        const double number = value.toDouble(minimum - 1.0);
        if (number < minimum || number > maximum || number != int(number))
            error(field, QStringLiteral("must be a whole number from %1 to %2").arg(minimum).arg(maximum));
        return value.toInt(otherwise);
    }

    bool boolean(const char* field)
    {
        const QJsonValue value = take(field);
        if (!value.isUndefined() && !value.isBool())
            error(field, QStringLiteral("must be true or false"));
        return value.toBool();
    }

    QUrl url(const char* field) { return resolved(QLatin1String(field), string(field, true)); }

    QHash<QString, QUrl> variations(const char* field, const QUrl& baseFile)
    {
        QHash<QString, QUrl> byName{{QString(), baseFile}};
        const QJsonValue value = take(field);
        if (!value.isUndefined() && !value.isObject())
            error(field, QStringLiteral("must be an object of file by variation"));
        const QJsonObject object = value.toObject();
        for (auto it = object.begin(); it != object.end(); ++it)
            byName.insert(it.key(),
                          resolved(QLatin1String(field) + QLatin1Char('.') + it.key(), it.value().toString()));
        return byName;
    }

    QString transition(const char* field)
    {
        const QString name = string(field, false);
        if (!name.isEmpty() && !TransitionManager::isTransition(name))
            error(field, QStringLiteral("there is no transition \"%1\"").arg(name.left(nameLimit)));
        return name;
    }

    /// To be called when all fields were read: whether the entry can be used.
    bool finish()
    {
        for (auto it = m_object.begin(); it != m_object.end(); ++it)
            if (!m_known.contains(it.key()))
                error(it.key().left(nameLimit), QStringLiteral("is not a known field"));
        return hasNoErrors();
    }

    void error(const QString& field, const QString& text)
    {
        if (hasNoErrors()) // one complaint per entry is enough
            m_errors->append((m_where.isEmpty() ? field : m_where + QLatin1Char('.') + field) + QStringLiteral(": ")
                             + text);
    }

private:
    void error(const char* field, const QString& text) { error(QString::fromLatin1(field), text); }
    bool hasNoErrors() const { return m_errors->size() == m_errorsBefore; }

    QJsonValue take(const char* field)
    {
        const QString key = QString::fromLatin1(field);
        m_known.insert(key);
        return m_object.value(key);
    }

    QUrl resolved(const QString& field, const QString& text)
    {
        if (!hasNoErrors())
            return QUrl();
        const QUrl url = m_base.resolved(QUrl(text));
        if (text.isEmpty() || !url.isValid())
            error(field, QStringLiteral("must name a QML file"));
        else if (!exists(url))
            error(field, QStringLiteral("the file \"%1\" does not exist").arg(text.left(2 * nameLimit)));
        return url;
    }

    const QJsonObject m_object;
    const QString m_where;
    const QUrl m_base;
    QStringList* const m_errors;
    const int m_errorsBefore;
    QSet<QString> m_known;
};

class Parser
{
public:
    Parser(const QString& path, const QString& prefix, int domain)
        : m_base(baseUrlOf(path))
        , m_prefix(prefix.isEmpty() ? QString() : prefix + QLatin1Char('.'))
        , m_domain(domain)
    {
        const JsonFile file = JsonFile::read(path);
        if (!file.error.isEmpty())
            m_result.errors.append(file.error);
        else
            parse(file.object);
    }

    ParsedDescriptor result() const { return m_result; }

private:
    void parse(const QJsonObject& document)
    {
        const QJsonValue version = document.value(QLatin1String("version"));
        if (version.toInt() != formatVersion) {
            m_result.errors.append(QStringLiteral("version: must be %1").arg(formatVersion));
            return;
        }
        const QHash<QString, std::function<void(Fields&)>> sections{
            {QStringLiteral("components"), [this](Fields& fields) { component(fields); }},
            {QStringLiteral("views"), [this](Fields& fields) { view(fields); }},
            {QStringLiteral("popups"), [this](Fields& fields) { popup(fields); }},
            {QStringLiteral("transients"), [this](Fields& fields) { transient(fields); }},
        };
        for (auto it = document.begin(); it != document.end(); ++it) {
            if (const auto section = sections.value(it.key()))
                entries(it.key(), it.value(), section);
            else if (it.key() == QLatin1String("shell"))
                shell(document);
            else if (it.key() != QLatin1String("version") && it.key() != QLatin1String("$schema"))
                m_result.errors.append(it.key().left(nameLimit) + QStringLiteral(": is not a known field"));
        }
    }

    void entries(const QString& section, const QJsonValue& value, const std::function<void(Fields&)>& read)
    {
        if (!value.isArray()) {
            m_result.errors.append(section + QStringLiteral(": must be an array"));
            return;
        }
        int number = 0;
        const QJsonArray array = value.toArray();
        for (const QJsonValue& entry : array) {
            const QString where = QStringLiteral("%1[%2]").arg(section).arg(number++);
            if (!entry.isObject()) {
                m_result.errors.append(where + QStringLiteral(": must be an object"));
                continue;
            }
            Fields fields(entry.toObject(), where, m_base, &m_result.errors);
            read(fields);
        }
    }

    void shell(const QJsonObject& document)
    {
        QStringList errors;
        Fields fields(document, QString(), m_base, &errors);
        m_result.shell = fields.url("shell");
        if (!errors.isEmpty())
            m_result.shell.clear();
        m_result.errors.append(errors);
    }

    void view(Fields& fields)
    {
        ViewDescriptor view;
        view.identifier = m_prefix + fields.name("name");
        view.url = fields.url("url");
        view.variations = fields.variations("variations", view.url);
        view.transition = fields.transition("transition");
        view.keepAlive = fields.boolean("keepAlive");
        view.domain = m_domain;
        if (fields.finish())
            m_result.views.append(view);
    }

    void popup(Fields& fields)
    {
        PopupDescriptor popup;
        popup.identifier = m_prefix + fields.name("name");
        popup.url = fields.url("url");
        popup.variations = fields.variations("variations", popup.url);
        popup.priority = fields.integer("priority", 0, 100, 0);
        popup.timeout = fields.integer("timeout", 0, longestTime, 0);
        if (fields.finish())
            m_result.popups.append(popup);
    }

    void transient(Fields& fields)
    {
        TransientDescriptor transient;
        transient.identifier = m_prefix + fields.name("name");
        transient.componentKey = m_prefix + fields.name("component");
        transient.timeout = fields.integer("timeout", 1, longestTime, defaultTransientTime);
        if (fields.finish())
            m_result.transients.append(transient);
    }

    void component(Fields& fields)
    {
        const QString key = m_prefix + fields.name("key");
        const ComponentDescriptor component{fields.url("url")};
        if (fields.finish())
            m_result.components.append({key, component});
    }

    const QUrl m_base;
    const QString m_prefix;
    const int m_domain;
    ParsedDescriptor m_result;
};

} // namespace

ParsedDescriptor parseDescriptor(const QString& path, const QString& prefix, int domain)
{
    return Parser(path, prefix, domain).result();
}

} // namespace HmiGuiFramework
