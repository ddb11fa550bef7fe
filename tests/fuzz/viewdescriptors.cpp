// SPDX-License-Identifier: MIT
// View descriptors: what is wrong is told and left out, what is right can be used as it is.
#include "fuzzing.h"

#include "descriptorparser.h"

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
    return 0;
}
