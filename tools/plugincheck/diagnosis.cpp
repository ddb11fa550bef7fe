// SPDX-License-Identifier: MIT
#include "diagnosis.h"

#include "arguments.h"
#include "elffile.h"
#include "probeprocess.h"

#include <QJsonArray>
#include <QLibraryInfo>
#include <QRegularExpression>

#include <cstring>

namespace {

using Effect = Diagnosis::Effect;

/// Where in the life of a plugin something happened.
const struct
{
    const char* name;
    const char* text;
} stages[] = {
    {"start", "before the plugin was loaded"},
    {"load", "while the library was loaded, in the constructor of a global object"},
    {"construct", "in the constructor of the plugin's root object"},
    {"create", "when it was asked for its keys, in createModuleIntegration() or registerEngine()"},
    {"register", "while its modules were set up: createRootState(), registerTypes(), setupRootContext(), views"},
    {"qml", "while its QML files were compiled"},
    {"engines", "when an engine was made for a language"},
    {"run", "after the start, in the event loop"},
    {"end", "at the end of the head unit"}};

QString stageText(const QJsonObject& report)
{
    const QString name = report.value(QLatin1String("stage")).toString();
    for (const auto& stage : stages)
        if (name == QLatin1String(stage.name))
            return QString::fromLatin1(stage.text);
    return QStringLiteral("at an unknown place");
}

QStringList texts(const QJsonValue& array)
{
    QStringList found;
    const QJsonArray values = array.toArray();
    for (const auto& value : values)
        found += value.toString();
    return found;
}

void judge(Diagnosis* diagnosis, Effect effect, const char* code, const QString& reason)
{
    diagnosis->effect = effect;
    diagnosis->code = QString::fromLatin1(code);
    diagnosis->reason = reason;
}

/// The library of another major version of Qt that this one is linked to, or an empty text.
QString foreignQt(const ElfFile& library)
{
    static const QRegularExpression core(QStringLiteral("^libQt(\\d+)Core\\.so"));
    const QStringList libraries = library.libraries();
    for (const QString& name : libraries)
        if (const auto match = core.match(name);
            match.hasMatch() && match.captured(1).toInt() != QLibraryInfo::version().majorVersion())
            return name;
    return QString();
}

/// What can be said before the file is loaded; false when that is all.
bool judgeFile(const ElfFile& library, Diagnosis* diagnosis)
{
    static const QHash<int, const char*> codes{{ElfFile::NotElf, "no-library"},
                                               {ElfFile::OtherArchitecture, "other-architecture"},
                                               {ElfFile::NotALibrary, "no-library"},
                                               {ElfFile::Damaged, "damaged"}};
    if (library.defect() == ElfFile::None)
        return true;
    judge(diagnosis, Diagnosis::Skips, codes.value(library.defect()), library.explanation());
    return false;
}

/// How the process ended, unless that was in order.
bool judgeEnd(const ProbeResult& result, int timeLimit, Diagnosis* diagnosis)
{
    const QString where = stageText(result.report);
    QString output = result.lastOutput;
    if (const QJsonValue fatal = result.report.value(QLatin1String("fatal")); fatal.isString())
        output = fatal.toString();
    const QString said = output.isEmpty() ? QString() : QStringLiteral(" Its last words: ") + output;
    if (result.end == ProbeResult::Hung)
        judge(diagnosis, Diagnosis::Hangs, "hung",
              QStringLiteral("It was not done after %1 s: it hung %2.").arg(timeLimit).arg(where));
    else if (const QJsonValue thrown = result.report.value(QLatin1String("threw")); thrown.isString())
        judge(diagnosis, Diagnosis::Ends, "threw",
              QStringLiteral("It %1, %2. Nobody catches that.").arg(thrown.toString(), where));
    else if (result.end == ProbeResult::Crashed)
        judge(diagnosis, Diagnosis::Ends, "crashed",
              QStringLiteral("It crashed with signal %1 (%2) %3.%4")
                  .arg(result.code)
                  .arg(QString::fromLocal8Bit(strsignal(result.code)), where, said));
    else if (!result.report.value(QLatin1String("complete")).toBool() || result.code != 0)
        judge(diagnosis, Diagnosis::Ends, "exited",
              QStringLiteral("It ended the process with exit code %1, %2.%3").arg(result.code).arg(where, said));
    else
        return true;
    return false;
}

bool judgeMetaData(const ElfFile& library, Diagnosis* diagnosis)
{
    const QJsonObject& report = diagnosis->report;
    if (const QString foreign = foreignQt(library); !foreign.isEmpty())
        judge(diagnosis, Diagnosis::Skips, "other-qt",
              QStringLiteral("It is built for another Qt (%1); the head unit uses Qt %2.")
                  .arg(foreign, QLibraryInfo::version().toString()));
    else if (!report.value(QLatin1String("isPlugin")).toBool())
        judge(diagnosis, Diagnosis::Skips, "no-plugin",
              QStringLiteral(
                  "It is a shared library but no Qt plugin: it has no Q_PLUGIN_METADATA that this Qt can read."));
    else if (!report.value(QLatin1String("isKnownInterface")).toBool())
        judge(diagnosis, Diagnosis::Skips, "unknown-interface",
              QStringLiteral("Its interface id is \"%1\"; the head unit knows \"com.kest.ivi.ModuleInterface\" and "
                             "\"com.kest.hmi.InputMethodEngineInterface\".")
                  .arg(report.value(QLatin1String("interface")).toString()));
    else
        return true;
    return false;
}

bool judgeLoading(Diagnosis* diagnosis)
{
    const QJsonObject& report = diagnosis->report;
    const QString error = report.value(QLatin1String("loadError")).toString();
    if (const QStringList missing = texts(report.value(QLatin1String("missingSymbols"))); !missing.isEmpty())
        judge(diagnosis, error.isEmpty() ? Diagnosis::Ends : Diagnosis::Skips, "missing-symbols",
              QStringLiteral("No library has these symbols: %1.").arg(missing.join(QStringLiteral(", "))));
    else if (error.contains(QLatin1String("incompatible Qt library")))
        judge(diagnosis, Diagnosis::Skips, "other-qt", error);
    else if (!error.isEmpty())
        judge(diagnosis, Diagnosis::Skips, "not-loaded", error);
    else if (!report.value(QLatin1String("implementsInterface")).toBool())
        judge(diagnosis, Diagnosis::Skips, "other-root",
              QStringLiteral(
                  "Its root object %1 does not implement the interface of its metadata; is Q_INTERFACES missing?")
                  .arg(report.value(QLatin1String("class")).toString()));
    else
        return true;
    return false;
}

/// Whether anything came of its keys. Which of them the core refused it has logged; for what the lists forbid it does not ask.
void judgeKeys(bool hasLists, Diagnosis* diagnosis)
{
    const QJsonObject& report = diagnosis->report;
    const QStringList keys = texts(report.value(QLatin1String("keys")));
    const QStringList refused = texts(report.value(QLatin1String("refusedKeys")));
    const bool isModule = report.contains(QLatin1String("modules"));
    if (keys.isEmpty())
        judge(diagnosis, Diagnosis::Skips, "no-keys",
              QStringLiteral("Its metadata has no array of strings \"Keys\", so nothing is asked of it."));
    else if (refused.size() == keys.size())
        judge(diagnosis, Diagnosis::Skips, "refused-keys",
              QStringLiteral("%1 for each of its keys: %2.")
                  .arg(isModule ? QStringLiteral("createModuleIntegration() gives null")
                                : QStringLiteral("registerEngine() gives false"),
                       refused.join(QStringLiteral(", "))));
    else if (isModule && hasLists && report.value(QLatin1String("modulesMade")).toInt() == 0)
        judge(diagnosis, Diagnosis::Skips, "blacklisted",
              QStringLiteral("The list of plugins forbids its name \"%1\".")
                  .arg(report.value(QLatin1String("name")).toString()));
}

/// Refused keys beside good ones are a problem as any other.
void addProblemsOfKeys(Diagnosis* diagnosis)
{
    QJsonArray problems = diagnosis->report.value(QLatin1String("problems")).toArray();
    const QStringList refused = texts(diagnosis->report.value(QLatin1String("refusedKeys")));
    for (const QString& key : refused)
        problems.append(QStringLiteral("Its key \"%1\" is refused by the plugin itself.").arg(key));
    diagnosis->report.insert(QStringLiteral("problems"), problems);
}

} // namespace

Diagnosis Diagnosis::of(const Arguments& arguments)
{
    Diagnosis diagnosis;
    diagnosis.file = arguments.file;
    const ElfFile library(arguments.file);
    if (!judgeFile(library, &diagnosis))
        return diagnosis;
    const ProbeResult result = runProbe(arguments.file, arguments.lists, arguments.timeLimit);
    diagnosis.report = result.report;
    if (result.end == ProbeResult::NotStarted) {
        judge(&diagnosis, Skips, "not-checked", result.error);
        return diagnosis;
    }
    const bool isLoaded = judgeEnd(result, arguments.timeLimit, &diagnosis) && judgeMetaData(library, &diagnosis)
                          && judgeLoading(&diagnosis);
    if (isLoaded)
        judgeKeys(!arguments.lists.isEmpty(), &diagnosis);
    if (diagnosis.effect == Uses)
        addProblemsOfKeys(&diagnosis);
    return diagnosis;
}

bool Diagnosis::isGood(bool strictly) const
{
    return effect == Uses && !(strictly && !report.value(QLatin1String("problems")).toArray().isEmpty());
}

QJsonObject Diagnosis::toJson() const
{
    static const char* const effects[] = {"uses", "skips", "ends", "hangs"};
    static const char* const members[] = {"interface",  "class", "name",    "keys",    "modules",
                                          "submodules", "views", "engines", "problems"};
    QJsonObject json{{QStringLiteral("file"), file},
                     {QStringLiteral("usable"), effect == Uses},
                     {QStringLiteral("headUnit"), QString::fromLatin1(effects[effect])}};
    if (!code.isEmpty())
        json.insert(QStringLiteral("reason"),
                    QJsonObject{{QStringLiteral("code"), code}, {QStringLiteral("text"), reason}});
    for (const char* const name : members)
        if (const QString member = QString::fromLatin1(name); report.contains(member))
            json.insert(member, report.value(member));
    return json;
}
