// SPDX-License-Identifier: MIT
// Property stores and value mappings against plain maps; languages against bare translators and one plain sort.
#include "ratios.h"

#include <AL2HMIBridge/LanguageModel>
#include <HmiCore/ConfigurationProcessor>
#include <HmiCore/HmiLanguageBundleModel>
#include <HmiCore/HmiPropertyStore>
#include <HmiCore/HmiTranslation>
#include <HmiCore/HmiTranslator>
#include <HmiCore/HmiValueMapper>
#include <HmiGuiFramework/AppSettings>

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QTemporaryDir>

#include <algorithm>
#include <memory>

using namespace HmiCore;

namespace {

QTemporaryDir& folder()
{
    static QTemporaryDir directory;
    return directory;
}

void write(const QString& name, const QByteArray& content)
{
    QFile file(folder().filePath(name));
    if (!file.open(QIODevice::WriteOnly) || file.write(content) != content.size())
        qFatal("cannot write %s", qPrintable(name));
}

QByteArray json(const QJsonValue& value)
{
    return (value.isArray() ? QJsonDocument(value.toArray()) : QJsonDocument(value.toObject())).toJson();
}

QString name(int number)
{
    return QStringLiteral("property%1").arg(number);
}

QJsonObject properties(int count)
{
    QJsonObject object;
    for (int i = 0; i < count; ++i)
        object.insert(name(i), QStringLiteral("value of property number %1").arg(i));
    return object;
}

template <typename Look>
void look(benchmark::State& state, Look once)
{
    for (auto _ : state)
        benchmark::DoNotOptimize(once());
}

void measureStores()
{
    write(QStringLiteral("p.json"), json(properties(200)));
    write(QStringLiteral("default.json"), json(QJsonObject{{QStringLiteral("only here"), 1}}));
    const auto element = [](const char* id, const char* file, bool isFallback) {
        return QJsonObject{{QStringLiteral("id"), QLatin1String(id)},
                           {QStringLiteral("propertyFile"), QLatin1String(file)},
                           {QStringLiteral("isFallback"), isFallback}};
    };
    write(QStringLiteral("config.json"),
          json(QJsonArray{element("-1", "default.json", false), element("1A", "p.json", true),
                          element("2B", "p.json", false)}));
    static HmiPropertyStore store(nullptr);
    store.loadConfiguration(folder().path(), QStringLiteral("config.json"));

    static QMap<int, QMap<QString, QVariant>> plain;
    for (const int id : {-1, 26, 43})
        plain.insert(id, properties(200).toVariantMap());
    static const QString hit = name(77);
    static const QString byDefault = QStringLiteral("only here");
    measure("plain maps",
            [](benchmark::State& state) { look(state, [] { return *plain.constFind(43)->constFind(hit); }); });
    measure("hit", [](benchmark::State& state) { look(state, [] { return store.getProperty(43, hit); }); });
    measure("default", [](benchmark::State& state) { look(state, [] { return store.getProperty(43, byDefault); }); });
    measure("plain default", [](benchmark::State& state) {
        look(state, [] {
            const auto own = plain.constFind(43)->constFind(byDefault);
            benchmark::DoNotOptimize(own);
            return *plain.constFind(-1)->constFind(hit);
        });
    });
    measure("fallback", [](benchmark::State& state) { look(state, [] { return store.getProperty(7, hit); }); });
    measure("unknown", [](benchmark::State& state) { look(state, [] { return store.getProperty(43, QString()); }); });
}

void measureMapper()
{
    QJsonArray elements;
    QMap<QString, QMap<int, QVariant>> both;
    for (int i = 0; i < 100; ++i) {
        QJsonArray values;
        for (int value = 0; value < 20; ++value) {
            values.append(QJsonObject{{QStringLiteral("value"), value}, {QStringLiteral("mapping"), name(value)}});
            both[name(i)].insert(value, name(value));
        }
        elements.append(QJsonObject{{QStringLiteral("valueName"), name(i)},
                                    {QStringLiteral("default"), QStringLiteral("?")},
                                    {QStringLiteral("values"), values}});
    }
    write(QStringLiteral("values.json"), json(elements));
    HmiValueMapper::instance()->loadValueMapping(folder().filePath(QStringLiteral("values.json")));
    static const QMap<QString, QMap<int, QVariant>> plain = both;
    static const QString hit = name(77);
    measure("plain mapping",
            [](benchmark::State& state) { look(state, [] { return *plain.constFind(hit)->constFind(7); }); });
    measure("mapped", [](benchmark::State& state) {
        look(state, [] { return HmiValueMapper::instance()->mappedValue(hit, 7); });
    });
}

void measureLoading()
{
    const QByteArray large = json(properties(5400));
    write(QStringLiteral("large.json"), large);
    measure("parse and convert", [](benchmark::State& state) {
        for (auto _ : state) {
            QFile file(folder().filePath(QStringLiteral("large.json")));
            if (!file.open(QIODevice::ReadOnly))
                return state.SkipWithError("no file");
            benchmark::DoNotOptimize(QJsonDocument::fromJson(file.readAll()).object().toVariantMap());
        }
    });
    measure("load properties", [](benchmark::State& state) {
        for (auto _ : state) {
            QMap<int, QMap<QString, QVariant>> into;
            ConfigurationProcessor::parse(folder().filePath(QStringLiteral("large.json")), 1, into);
            benchmark::DoNotOptimize(into);
        }
    });
}

/// A catalogue of texts as a module has them.
void writeCatalogue(const QString& file)
{
    QString ts = QStringLiteral(
        "<?xml version=\"1.0\"?><!DOCTYPE TS><TS version=\"2.1\" language=\"de_DE\"><context><name>Screen</name>");
    for (int i = 0; i < 150; ++i)
        ts +=
            QStringLiteral(
                "<message><source>Text number %1</source><translation>Der Text mit der Nummer %1</translation></message>")
                .arg(i);
    write(file + QStringLiteral(".ts"), (ts + QStringLiteral("</context></TS>")).toUtf8());
    if (QProcess::execute(QStringLiteral(LRELEASE),
                          {QStringLiteral("-silent"), folder().filePath(file + QStringLiteral(".ts"))})
        != 0)
        qFatal("lrelease failed");
}

void measureTranslations()
{
    writeCatalogue(QStringLiteral("bare_text"));
    static QTranslator stock;
    static HmiTranslator ours(nullptr);
    const QString file = folder().filePath(QStringLiteral("bare_text.qm"));
    if (!stock.load(file) || !ours.load(file))
        qFatal("no catalogue");
    measure("stock hit",
            [](benchmark::State& state) { look(state, [] { return stock.translate("Screen", "Text number 77"); }); });
    measure("our hit",
            [](benchmark::State& state) { look(state, [] { return ours.translate("Screen", "Text number 77"); }); });
}

const char* const switchNames[][2] = {
    {"bare switch 1", "switch 1"}, {"bare switch 10", "switch 10"}, {"bare switch 50", "switch 50"}};
constexpr int counts[] = {1, 10, 50};

void measureSwitches()
{
    for (size_t i = 0; i < std::size(counts); ++i) {
        const QString directory = QStringLiteral("set%1").arg(counts[i]);
        QDir(folder().path()).mkdir(directory);
        for (int number = 0; number < counts[i]; ++number)
            for (const char* const language : {"de_DE", "fr_FR"})
                QFile::copy(
                    folder().filePath(QStringLiteral("bare_text.qm")),
                    folder().filePath(
                        QStringLiteral("%1/m%2_%3.qm").arg(directory).arg(number).arg(QLatin1String(language))));
        measure(switchNames[i][0], [directory, count = counts[i]](benchmark::State& state) {
            std::vector<std::unique_ptr<QTranslator>> translators;
            for (int number = 0; number < count; ++number) {
                translators.push_back(std::make_unique<QTranslator>());
                QCoreApplication::installTranslator(translators.back().get());
            }
            const QString path = folder().filePath(directory);
            bool german = false;
            for (auto _ : state) {
                german = !german;
                for (int number = 0; number < count; ++number)
                    benchmark::DoNotOptimize(translators[size_t(number)]->load(
                        QStringLiteral("m%1_%2").arg(number).arg(QLatin1String(german ? "de_DE" : "fr_FR")), path));
            }
            QCoreApplication::sendPostedEvents();
        });
        measure(switchNames[i][1], [directory](benchmark::State& state) {
            HmiTranslation translation(folder().filePath(directory), nullptr);
            bool german = false;
            for (auto _ : state) {
                german = !german;
                benchmark::DoNotOptimize(
                    translation.activateTranslation(german ? QStringLiteral("de_DE") : QStringLiteral("fr_FR")));
            }
            translation.deactivate();
            QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        });
    }
}

/// 200 languages; those beyond the platform's are read as the empty locale, which the bundle has as well.
class Languages : public QAbstractListModel
{
public:
    static constexpr int count = 200;

    int rowCount(const QModelIndex& parent) const override { return parent.isValid() ? 0 : count; }
    QVariant data(const QModelIndex& index, int role) const override
    {
        return role == 2 ? QVariant(m_names.at(index.row())) : QVariant(QString());
    }
    const QStringList& names() const { return m_names; }

private:
    const QStringList m_names = [] {
        QStringList names;
        for (int i = 0; i < count; ++i)
            names.append(QStringLiteral("Language %1").arg((i * 7919) % 1000));
        return names;
    }();
};

void measureBundles()
{
    QDir(folder().path()).mkdir(QStringLiteral("languageBundles"));
    QJsonArray locales{QString()};
    for (int row = 0; row < AL2HMIBridge::LanguageModel::instance()->rowCount(); ++row)
        locales.append(AL2HMIBridge::LanguageModel::instance()->index(row, 0).data(1).toString());
    const auto bundle = [&locales](const char* id) {
        return QJsonObject{{QStringLiteral("bundleId"), QLatin1String(id)}, {QStringLiteral("locales"), locales}};
    };
    write(QStringLiteral("languageBundles/config.json"), json(QJsonArray{bundle("one"), bundle("other")}));
    HmiGuiFramework::AppSettings::mainFolderPath = folder().path() + QLatin1Char('/');
    static Languages languages;
    static HmiLanguageBundleModel model(nullptr);
    model.setSourceModel(&languages);
    model.setBundleId(QStringLiteral("one"));
    if (model.count() != Languages::count)
        qFatal("the model has %d of %d languages", model.count(), Languages::count);
    measure("stable sort", [](benchmark::State& state) {
        for (auto _ : state) {
            QStringList names = languages.names();
            std::stable_sort(names.begin(), names.end(), [](const QString& left, const QString& right) {
                return left.compare(right, Qt::CaseInsensitive) < 0;
            });
            benchmark::DoNotOptimize(names);
        }
    });
    measure("bundle model", [](benchmark::State& state) {
        bool other = false;
        for (auto _ : state) {
            other = !other;
            model.setBundleId(other ? QStringLiteral("other") : QStringLiteral("one"));
        }
    });
}

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    measureStores();
    measureMapper();
    measureLoading();
    measureTranslations();
    measureSwitches();
    measureBundles();
    Ratios ratios;
    ratios.run(argc, argv);
    ratios.row("getProperty, hit / two map look-ups", "hit", "plain maps", 1.5);
    ratios.row("getProperty, default entry / four map look-ups", "default", "plain default", 1.5);
    ratios.row("getProperty, fallback id / two map look-ups", "fallback", "plain maps", 1.5);
    ratios.row("getProperty, unknown / two map look-ups", "unknown", "plain maps", 1.5);
    ratios.row("mappedValue / two map look-ups", "mapped", "plain mapping", 1.5);
    ratios.row("loading properties / parse and toVariantMap", "load properties", "parse and convert", 1.1);
    ratios.row("HmiTranslator hit / QTranslator hit", "our hit", "stock hit", 1.2);
    ratios.row("language switch, 1 catalogue / bare translators", "switch 1", "bare switch 1", 1.3);
    ratios.row("language switch, 10 catalogues / bare translators", "switch 10", "bare switch 10", 1.3);
    ratios.row("language switch, 50 catalogues / bare translators", "switch 50", "bare switch 50", 1.3);
    ratios.row("200 languages filtered and sorted / one stable sort", "bundle model", "stable sort", 4);
}
