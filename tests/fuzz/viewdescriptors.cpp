// SPDX-License-Identifier: MIT
// View descriptors: what is wrong is told and left out, what is right can be used as it is.
#include "fuzzing.h"

#include "descriptorparser.h"

#include <QHash>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>

using namespace HmiGuiFramework;
using Fuzzing::check;

namespace {

constexpr int longestName = 128;
constexpr int longestTime = 3600 * 1000;

void checkName(const QString& identifier)
{
    check(identifier.startsWith(QLatin1String("Fuzz.")), "names carry the prefix", identifier);
    check(identifier.size() > 5 && identifier.size() <= 5 + longestName, "names have a length", identifier);
}

void checkFiles(const QUrl& url, const QHash<QString, QUrl>& variations)
{
    check(url.isValid() && !url.isEmpty(), "a view has a file", url.toString());
    check(variations.value(QString()) == url || variations.contains(QString()), "the file itself is a variation");
    for (const QUrl& variation : variations)
        check(variation.isValid(), "variations have files", variation.toString());
}

/// Each entry is either taken, or told of once: "views[3].url: ...".
void checkEntries(const QJsonObject& document, const QString& section, int taken, const QHash<QString, int>& complaints)
{
    const QJsonArray entries = document.value(section).toArray();
    int told = 0;
    for (int i = 0; i < entries.size(); ++i) {
        const int count = complaints.value(QStringLiteral("%1[%2]").arg(section).arg(i));
        check(count <= 1, "an entry is told of once", section);
        told += count;
    }
    check(taken + told == entries.size(), "an entry is taken or told of", section);
}

void checkAllEntries(const QByteArray& content, const ParsedDescriptor& parsed)
{
    const QJsonObject document = QJsonDocument::fromJson(content).object();
    if (document.value(QLatin1String("version")).toInt() != 1) {
        check(parsed.errors.size() == 1 && parsed.views.isEmpty() && parsed.popups.isEmpty()
                  && parsed.transients.isEmpty() && parsed.components.isEmpty() && parsed.shell.isEmpty(),
              "of another version nothing is taken");
        return;
    }
    const QStringList keys = document.keys();
    if (std::any_of(keys.begin(), keys.end(), [](const QString& key) { return key.contains(QLatin1Char(']')); }))
        return; // what is told of such a field looks like a complaint about an entry
    QHash<QString, int> complaints;
    for (const QString& error : parsed.errors)
        ++complaints[error.left(error.indexOf(QLatin1Char(']')) + 1)];
    checkEntries(document, QStringLiteral("views"), int(parsed.views.size()), complaints);
    checkEntries(document, QStringLiteral("popups"), int(parsed.popups.size()), complaints);
    checkEntries(document, QStringLiteral("transients"), int(parsed.transients.size()), complaints);
    checkEntries(document, QStringLiteral("components"), int(parsed.components.size()), complaints);
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv)
{
    Fuzzing::start(argc, *argv);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    const QByteArray content = Fuzzing::Input(data, size).rest();
    if (Fuzzing::repeatsKeys(content))
        return 0;
    static Fuzzing::MemoryFile file;
    file.write(content);
    const ParsedDescriptor parsed = parseDescriptor(file.path(), QStringLiteral("Fuzz"), 7);
    for (const ViewDescriptor& view : parsed.views) {
        checkName(view.identifier);
        checkFiles(view.url, view.variations);
        check(view.domain == 7, "views belong to their module");
    }
    for (const PopupDescriptor& popup : parsed.popups) {
        checkName(popup.identifier);
        checkFiles(popup.url, popup.variations);
        check(popup.priority >= 0 && popup.priority <= 100, "priorities have a range");
        check(popup.timeout >= 0 && popup.timeout <= longestTime, "times have a range");
    }
    for (const TransientDescriptor& transient : parsed.transients) {
        checkName(transient.identifier);
        checkName(transient.componentKey);
        check(transient.timeout >= 1 && transient.timeout <= longestTime, "times have a range");
    }
    for (const auto& component : parsed.components) {
        checkName(component.first);
        check(component.second.url.isValid(), "components have a file");
    }
    for (const QString& error : parsed.errors)
        check(!error.isEmpty() && error.size() < 4096, "errors say something, and not too much", error.left(200));
    checkAllEntries(content, parsed);
    return 0;
}
