// SPDX-License-Identifier: MIT
#include "registeredtypes.h"

#include <QDir>
#include <QMetaEnum>
#include <QMetaMethod>
#include <QMetaProperty>
#include <QSaveFile>
#include <QSet>
#include <QTextStream>

#include <private/qhashedstring_p.h>
#include <private/qqmlmetatype_p.h>

#include <algorithm>

namespace {

/// What Qt's own modules describe; everything else that a type derives from goes into its module's description.
QSet<QByteArray> describedByQt()
{
    return {"QObject", "QAbstractItemModel", "QAbstractListModel", "QQuickItem", "QQuickPaintedItem"};
}

#if QT_VERSION_MAJOR >= 6
int majorVersion(const QQmlType& type)
{
    return type.version().majorVersion();
}
int minorVersion(const QQmlType& type)
{
    return type.version().minorVersion();
}
#else
int majorVersion(const QQmlType& type)
{
    return type.majorVersion();
}
int minorVersion(const QQmlType& type)
{
    return type.minorVersion();
}
#endif

/// Writes the lines of a description, each as deep as the braces around it.
class Writer
{
public:
    void open(const QString& object)
    {
        line(object + QStringLiteral(" {"));
        ++m_depth;
    }

    void close()
    {
        --m_depth;
        line(QStringLiteral("}"));
    }

    void line(const QString& text) { m_text += QByteArray(m_depth * 4, ' ') + text.toUtf8() + '\n'; }

    QByteArray text() const { return m_text; }

private:
    QByteArray m_text;
    int m_depth = 0;
};

QString quoted(QString text)
{
    text.replace(QLatin1Char('\\'), QLatin1String("\\\\")).replace(QLatin1Char('"'), QLatin1String("\\\""));
    return QLatin1Char('"') + text + QLatin1Char('"');
}

QString field(const char* name, const QString& value)
{
    return QStringLiteral("%1: %2").arg(QLatin1String(name), value);
}

/// The fields that tell a type: `QList<X>` is a list of X, `X*` a pointer to one.
QString typeFields(QByteArray type)
{
    QString suffix;
    if (type.startsWith("QList<") && type.endsWith('>')) {
        type = type.mid(6, type.size() - 7);
        suffix = QStringLiteral("; isList: true");
    }
    if (type.endsWith('*')) {
        type.chop(1);
        suffix += QStringLiteral("; isPointer: true");
    }
    return field("type", quoted(QString::fromLatin1(type.trimmed()))) + suffix;
}

void writeEnum(Writer* out, const QMetaEnum& values)
{
    out->open(QStringLiteral("Enum"));
    out->line(field("name", quoted(QString::fromLatin1(values.name()))));
    if (values.isFlag())
        out->line(field("isFlag", QStringLiteral("true")));
    QStringList pairs;
    for (int i = 0; i < values.keyCount(); ++i)
        pairs.append(QStringLiteral("    %1: %2").arg(quoted(QString::fromLatin1(values.key(i)))).arg(values.value(i)));
    out->line(QStringLiteral("values: {"));
    for (int i = 0; i < pairs.size(); ++i)
        out->line(pairs.at(i) + (i + 1 < pairs.size() ? QStringLiteral(",") : QString()));
    out->line(QStringLiteral("}"));
    out->close();
}

void writeProperty(Writer* out, const QMetaProperty& property)
{
    QStringList fields{field("name", quoted(QString::fromLatin1(property.name()))), typeFields(property.typeName())};
    if (!property.isWritable())
        fields.append(field("isReadonly", QStringLiteral("true")));
    if (property.hasNotifySignal())
        fields.append(field("notify", quoted(QString::fromLatin1(property.notifySignal().name()))));
    out->line(QStringLiteral("Property { %1 }").arg(fields.join(QLatin1String("; "))));
}

void writeMethod(Writer* out, const QMetaMethod& method)
{
    const bool isSignal = method.methodType() == QMetaMethod::Signal;
    out->open(isSignal ? QStringLiteral("Signal") : QStringLiteral("Method"));
    out->line(field("name", quoted(QString::fromLatin1(method.name()))));
    if (method.returnType() != QMetaType::Void)
        out->line(typeFields(method.typeName()));
    const QList<QByteArray> types = method.parameterTypes();
    const QList<QByteArray> names = method.parameterNames();
    for (int i = 0; i < types.size(); ++i)
        out->line(QStringLiteral("Parameter { %1; %2 }")
                      .arg(field("name", quoted(QString::fromLatin1(names.at(i)))), typeFields(types.at(i))));
    out->close();
}

void writeMembers(Writer* out, const QMetaObject* type)
{
    for (int i = type->enumeratorOffset(); i < type->enumeratorCount(); ++i)
        writeEnum(out, type->enumerator(i));
    for (int i = type->propertyOffset(); i < type->propertyCount(); ++i)
        writeProperty(out, type->property(i));
    for (int i = type->methodOffset(); i < type->methodCount(); ++i) {
        const QMetaMethod method = type->method(i);
        if (method.access() == QMetaMethod::Public)
            writeMethod(out, method);
    }
}

void openComponent(Writer* out, const QMetaObject* type)
{
    out->open(QStringLiteral("Component"));
    out->line(field("name", quoted(QString::fromLatin1(type->className()))));
    out->line(field("accessSemantics", quoted(QStringLiteral("reference"))));
    if (type->superClass())
        out->line(field("prototype", quoted(QString::fromLatin1(type->superClass()->className()))));
}

void writeType(Writer* out, const RegisteredType& type)
{
    openComponent(out, type.metaObject);
    if (!type.name.isEmpty()) {
        out->line(field("exports", QStringLiteral("[\"%1/%2 %3.%4\"]")
                                       .arg(type.module, type.name)
                                       .arg(type.majorVersion)
                                       .arg(type.minorVersion)));
        const int revision = type.majorVersion * 256 + type.minorVersion;
        out->line(field("exportMetaObjectRevisions", QStringLiteral("[%1]").arg(revision)));
    }
    if (!type.isCreatable)
        out->line(field("isCreatable", QStringLiteral("false"))
                  + (type.whyNotCreatable.isEmpty() ? QString() : QStringLiteral(" // ") + type.whyNotCreatable));
    if (type.isSingleton)
        out->line(field("isSingleton", QStringLiteral("true")));
    writeMembers(out, type.metaObject);
    out->close();
}

void writeNeeded(Writer* out, const QMetaObject* type, QSet<QByteArray>* known);

/// A class that is not registered, but that registered ones derive from or have as the type of a property.
void writeUnregistered(Writer* out, const QMetaObject* type, QSet<QByteArray>* known)
{
    if (!type || known->contains(type->className()))
        return;
    known->insert(type->className());
    writeNeeded(out, type, known);
    openComponent(out, type);
    out->line(field("isCreatable", QStringLiteral("false")));
    writeMembers(out, type);
    out->close();
}

void writeNeeded(Writer* out, const QMetaObject* type, QSet<QByteArray>* known)
{
    writeUnregistered(out, type->superClass(), known);
    for (int i = type->propertyOffset(); i < type->propertyCount(); ++i) {
        const QMetaProperty property = type->property(i);
        const QByteArray name = property.typeName();
        if (name.endsWith('*') && !known->contains(name.chopped(1)))
            writeUnregistered(out, QMetaType(property.userType()).metaObject(), known);
    }
}

bool writeFile(const QString& path, const QByteArray& content, QString* error)
{
    QSaveFile file(path);
    if (file.open(QIODevice::WriteOnly) && file.write(content) == content.size() && file.commit())
        return true;
    *error = QStringLiteral("%1: %2").arg(path, file.errorString());
    return false;
}

} // namespace

QList<RegisteredType> registeredTypes(const QStringList& modules)
{
    QList<QQmlType> types;
    const auto registered = QQmlMetaType::qmlTypes();
    for (const QQmlType& type : registered) {
        if (modules.contains(QString(type.module())) && type.metaObject())
            types.append(type);
    }
    std::sort(types.begin(), types.end(),
              [](const QQmlType& left, const QQmlType& right) { return left.index() < right.index(); });
    QList<RegisteredType> result;
    for (const QQmlType& type : std::as_const(types)) {
        const bool isCreatable = type.isCreatable() && !type.isSingleton() && !type.elementName().isEmpty();
        result.append({type.module(), majorVersion(type), minorVersion(type), type.elementName(), type.metaObject(),
                       type.isSingleton(), isCreatable, type.noCreationReason()});
    }
    return result;
}

QByteArray typeDescription(const QList<RegisteredType>& types)
{
    QSet<QByteArray> known = describedByQt();
    for (const RegisteredType& type : types)
        known.insert(type.metaObject->className());
    Writer out;
    out.line(QStringLiteral("import QtQuick.tooling 1.2\n"));
    out.line(QStringLiteral(
        "// For editors and linters only. Made from the registered types when the library was built.\n"));
    out.open(QStringLiteral("Module"));
    for (const RegisteredType& type : types) {
        writeNeeded(&out, type.metaObject, &known);
        writeType(&out, type);
    }
    out.close();
    return out.text();
}

bool writeDescriptions(const QString& directory, const QStringList& modules, QString* error)
{
    for (const QString& module : modules) {
        const QList<RegisteredType> types = registeredTypes({module});
        if (types.isEmpty()) {
            *error = QStringLiteral("no type of the module %1 is registered").arg(module);
            return false;
        }
        const QString folder =
            directory + QLatin1Char('/') + QString(module).replace(QLatin1Char('.'), QLatin1Char('/'));
        if (!QDir().mkpath(folder)) {
            *error = QStringLiteral("%1: the folder cannot be made").arg(folder);
            return false;
        }
        const QByteArray list = "module " + module.toUtf8()
                                + "\ntypeinfo plugins.qmltypes\ndepends QtQml.Models 2.15\ndepends QtQuick 2.15\n";
        if (!writeFile(folder + QLatin1String("/plugins.qmltypes"), typeDescription(types), error)
            || !writeFile(folder + QLatin1String("/qmldir"), list, error))
            return false;
    }
    return true;
}
