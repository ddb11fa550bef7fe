// SPDX-License-Identifier: MIT
#include "textreport.h"

#include "diagnosis.h"

#include <QJsonArray>
#include <QStringList>

namespace {

constexpr int labelWidth = 13;

const char* const verdicts[] = {"can be used", "is skipped by the head unit", "ends the head unit",
                                "hangs the head unit"};

QString line(const char* label, const QString& text)
{
    return QStringLiteral("  %1%2\n").arg(QString::fromLatin1(label), -labelWidth).arg(text);
}

QString textOf(const QJsonObject& object, const char* member)
{
    return object.value(QLatin1String(member)).toVariant().toString();
}

QString moduleText(const QJsonObject& module)
{
    const QString kind = textOf(module, "kind");
    QStringList parts{QStringLiteral("%1 (id %2)").arg(textOf(module, "name"), textOf(module, "id"))};
    parts += kind == QLatin1String("menu")         ? QStringLiteral("in the menu")
             : kind == QLatin1String("background") ? QStringLiteral("in the background")
                                                   : QStringLiteral("of the kind ") + kind;
    parts += QStringLiteral("priority ") + textOf(module, "priority");
    parts += QStringLiteral("domain ") + textOf(module, "domain");
    parts += module.value(QLatin1String("hasRootState")).toBool()
                 ? QStringLiteral("root state ") + textOf(module, "rootState")
                 : QStringLiteral("without a root state");
    if (const QString icon = textOf(module, "icon"); !icon.isEmpty())
        parts += QStringLiteral("icon ") + icon;
    parts += QStringLiteral("views from ") + textOf(module, "viewDescriptor");
    return parts.join(QStringLiteral(", "));
}

QString viewText(const QJsonObject& view)
{
    return QStringLiteral("%1  %2").arg(textOf(view, "name"), textOf(view, "url"));
}

QString submoduleText(const QJsonObject& submodule)
{
    const QString kind = textOf(submodule, "kind");
    if (kind == QLatin1String("host"))
        return QStringLiteral("shows pages of other modules");
    return QStringLiteral("%1, %2, views from %3")
        .arg(textOf(submodule, "name"),
             kind == QLatin1String("hosted") ? QStringLiteral("a page in the host of another module")
                                             : QStringLiteral("a page that other modules may ask for"),
             textOf(submodule, "viewDescriptor"));
}

QString engineText(const QJsonObject& engine)
{
    static const char* const languages[] = {"", "Simplified Chinese", "Traditional Chinese", "Latin"};
    const int language = engine.value(QLatin1String("language")).toInt();
    QString text = QStringLiteral("%1, language %2").arg(textOf(engine, "kind")).arg(language);
    if (language > 0 && language < int(std::size(languages)))
        text += QStringLiteral(" (%1)").arg(QString::fromLatin1(languages[language]));
    return text + QStringLiteral(", class ") + textOf(engine, "class");
}

/// One line for each entry of an array, the label in the first.
template <typename Text>
QString lines(const char* label, const QJsonValue& array, Text text)
{
    QString all;
    const QJsonArray entries = array.toArray();
    for (const auto& entry : entries)
        all += line(all.isEmpty() ? label : "", text(entry));
    return all;
}

} // namespace

QString textReport(const Diagnosis& diagnosis)
{
    const QJsonObject& report = diagnosis.report;
    const auto member = [&](const char* name) { return report.value(QLatin1String(name)); };
    const auto plain = [](const QJsonValue& value) { return value.toString(); };
    QString text =
        QStringLiteral("%1 %2.\n")
            .arg(diagnosis.file.section(QLatin1Char('/'), -1), QString::fromLatin1(verdicts[diagnosis.effect]));
    if (!diagnosis.reason.isEmpty())
        text += line("because", diagnosis.reason);
    if (const QString interface = member("interface").toString(); !interface.isEmpty())
        text += line("interface", interface);
    if (const QString name = member("name").toString(); !name.isEmpty())
        text += line("name", name);
    text += lines("key", member("keys"), plain);
    text += lines("module", member("modules"), [](const QJsonValue& value) { return moduleText(value.toObject()); });
    for (const char* const kind : {"view", "popup", "transient"}) {
        QJsonArray ofKind;
        const QJsonArray views = member("views").toArray();
        for (const auto& view : views)
            if (textOf(view.toObject(), "kind") == QLatin1String(kind))
                ofKind.append(view);
        text += lines(kind, ofKind, [](const QJsonValue& value) { return viewText(value.toObject()); });
    }
    text +=
        lines("page", member("submodules"), [](const QJsonValue& value) { return submoduleText(value.toObject()); });
    text += lines("engine", member("engines"), [](const QJsonValue& value) { return engineText(value.toObject()); });
    return text + lines("problem", member("problems"), plain);
}
