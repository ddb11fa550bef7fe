// SPDX-License-Identifier: MIT
// Every document that is read. The first byte of an input chooses the reader, the rest is the document.
#include "fuzzing.h"

#include "keylayout.h"
#include "pluginlists.h"
#include "scenario.h"
#include "recording.h"
#include "streetgraph.h"
#include "themedocument.h"
#include "tourfile.h"
#include "town.h"

#include <AL2HMIBridge/BridgePlayer>
#include <HmiCore/HmiMarketPropertyStore>
#include <HmiCore/HmiValueMapper>
#include <HmiCore/LanguagePackParser>
#include <HmiCore/LanguagePropertyParser>
#ifdef HAS_KEY_MAPS
#include <HmiVehicle/keymap.h>
#endif

#include <QFile>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>
#include <cmath>

using namespace HmiCore;
using Fuzzing::check;
using Fuzzing::MemoryFile;

namespace {

/// The document as Qt reads it, apart from the reader under test.
QJsonDocument document(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QJsonDocument::fromJson(file.readAll()) : QJsonDocument();
}

void properties(const MemoryFile& file)
{
    QMap<int, QMap<QString, QVariant>> properties;
    ConfigurationProcessor::parse(file.path(), 3, properties);
    const QJsonDocument plain = document(file.path());
    check(properties.contains(3) == !plain.isNull(), "what is JSON is kept, and nothing else");
    check(properties.value(3) == plain.object().toVariantMap(), "properties are those of the document");
}

void propertyConfiguration(const MemoryFile& file)
{
    HmiPropertyStore store(nullptr);
    store.loadConfiguration(MemoryFile::folder(), file.name());
    for (const int id : {-1, 0, 1, 2, 255})
        for (int again = 0; again < 2; ++again)
            store.getProperty(id, QStringLiteral("languageBundle"));
    check(document(file.path()).isArray() || !store.getProperty(2, QString()).isValid(),
          "without configurations there are no properties");
}

void valueMappings(const MemoryFile& file)
{
    const auto mappings = ValueMappingProcessor::parse(file.path());
    HmiValueMapper* const mapper = HmiValueMapper::instance();
    mapper->loadValueMapping(file.path());
    for (auto values = mappings.first.constBegin(); values != mappings.first.constEnd(); ++values)
        for (auto value = values->constBegin(); value != values->constEnd(); ++value)
            check(mapper->mappedValue(values.key(), value.key()) == *value, "a mapping is found", values.key());
    check(!mapper->mappedValue(QStringLiteral("nobody has this name"), 0).isValid(), "what is not there is not found");
}

void languageBundles(const MemoryFile& file)
{
    const auto bundles = LanguagePackParser().parse(file.name(), MemoryFile::folder());
    int fallbacks = 0;
    for (const HmiLanguagePackCollection::LanguageBundle& bundle : bundles) {
        fallbacks += bundle.isFallback ? 1 : 0;
        check(!bundle.defaultLocale.isEmpty() || bundle.locales.value(0).isEmpty(), "the first locale is the default");
    }
    check(fallbacks <= 1, "only the first that says so is the fallback");
}

void languageProperties(const MemoryFile& file)
{
    const auto stores = LanguagePropertyParser().parse(file.name(), MemoryFile::folder());
    check(stores.size() <= document(file.path()).array().size(), "no more than the document has");
}

void theme(const MemoryFile& file)
{
    const auto theme = HmiGuiFramework::ThemeDocument::read(file.path());
    if (!theme.error.isEmpty()) {
        check(theme.palettes.isEmpty() || !theme.error.isEmpty(), "an error leaves nothing");
        return;
    }
    check(theme.palettes.contains(theme.defaultPalette), "the default palette is there", theme.defaultPalette);
    for (const QVariantMap& palette : theme.palettes)
        check(!palette.isEmpty() && palette.keys() == theme.palettes.constBegin()->keys(),
              "all palettes colour the same");
}

void keyLayout(const MemoryFile& file)
{
    QString error;
    const std::optional<KeyLayout> layout = KeyLayout::read(file.path(), &error);
    check(layout.has_value() == error.isEmpty(), "a layout or an error", error);
    if (!layout)
        return;
    const QVariantList rows = layout->rows(false);
    const QVariantList mirrored = layout->rows(true);
    check(!rows.isEmpty() && rows.size() == mirrored.size(), "mirroring keeps the rows");
    for (int i = 0; i < rows.size(); ++i) {
        QVariantList keys = rows.at(i).toList();
        check(keys.size() == mirrored.at(i).toList().size(), "mirroring keeps the keys");
        for (const QVariant& key : std::as_const(keys))
            check(key.toMap().value(QStringLiteral("width")).toDouble() > 0, "keys are as wide as something");
    }
}

template <typename Lines>
void lines(const MemoryFile& file)
{
    Lines lines;
    const bool loaded = lines.load(file.path());
    check(loaded == lines.errorString().isEmpty(), "loaded, or a reason", lines.errorString());
    check(loaded == Lines().load(file.path()), "the same again");
}

void tour(const MemoryFile& file)
{
    lines<TourFile>(file);
}

void scenario(const MemoryFile& file)
{
    lines<HmiVehicle::Scenario>(file);
}

void recording(const MemoryFile& file)
{
    lines<HmiVehicle::Recording>(file);
    HmiVehicle::Scenario::isRecording(file.path());
}

void playback(const MemoryFile& file)
{
    AL2HMIBridge::BridgePlayer player;
    check(player.load(file.path()) == player.errorString().isEmpty(), "loaded, or a reason", player.errorString());
}

void town(const MemoryFile& file)
{
    QString error;
    const std::shared_ptr<const Town> town = Town::load(file.path(), &error);
    check((town != nullptr) == error.isEmpty(), "a town or an error", error);
    if (!town || town->streets.size() > 50)
        return;
    const StreetGraph graph(*town);
    for (const Place& place : town->places) {
        const Route route = graph.route(town->start, place.at, false);
        graph.onStreet(place.at);
        check(route.length() >= 0 || std::isnan(route.length()), "no way is shorter than none");
    }
}

void keyMap([[maybe_unused]] const MemoryFile& file)
{
#ifdef HAS_KEY_MAPS
    HmiVehicle::KeyMap map;
    check(map.load(file.path()) == map.errorString().isEmpty(), "loaded, or a reason", map.errorString());
    map.keyFor(30);
    map.dialFor(8);
#endif
}

void pluginLists(const MemoryFile& file)
{
    const PluginLists lists = PluginLists::read(file.path());
    for (const QString& name : lists.blacklist)
        check(lists.allow(name) == lists.whitelist.contains(name), "the white list rescues", name);
}

struct Reader
{
    char letter;
    void (*read)(const MemoryFile& file);
};

constexpr Reader readers[] = {
    {'p', properties},
    {'c', propertyConfiguration},
    {'v', valueMappings},
    {'b', languageBundles},
    {'l', languageProperties},
    {'t', theme},
    {'k', keyLayout},
    {'o', tour},
    {'s', scenario},
    {'r', recording},
    {'y', playback},
    {'w', town},
    {'m', keyMap},
    {'i', pluginLists},
};

} // namespace

extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv)
{
    Fuzzing::start(argc, *argv);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    Fuzzing::Input input(data, size);
    const char letter = char(input.byte());
    const auto* const reader = std::find_if(std::begin(readers), std::end(readers),
                                            [letter](const Reader& known) { return known.letter == letter; });
    if (reader == std::end(readers))
        return 0;
    const QByteArray content = input.rest();
    if (Fuzzing::repeatsKeys(content))
        return 0;
    static MemoryFile file;
    file.write(content);
    reader->read(file);
    return 0;
}
