// SPDX-License-Identifier: MIT
// Loads the input engines from their plugins, as the head unit does, and tells how well they understand what was recorded.
#include "accuracy.h"

#include <HmiCore/DummyEngine>
#include <HmiCore/DummyRecognizer>
#include <HmiCore/HmiComplexKeyboard>
#include <HmiCore/HmiHandwriting>
#include <HmiCore/InputMethodEngineInterface>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QDir>
#include <QJsonArray>
#include <QJsonObject>
#include <QPluginLoader>

#include <algorithm>
#include <cstdio>
#include <optional>

using namespace HmiCore;

namespace {

/// Recordings of one engine.
struct Set
{
    const char* engine;
    const char* file;
    int language;
    bool isTyped;
};

constexpr Set sets[] = {
    {"Latin handwriting", "strokes/latin-upright.txt", HmiHandwriting::Latin, false},
    {"Latin handwriting", "strokes/latin-slanted.txt", HmiHandwriting::Latin, false},
    {"Simplified handwriting", "strokes/simplified.txt", HmiHandwriting::SimplifiedChinese, false},
    {"Traditional handwriting", "strokes/traditional.txt", HmiHandwriting::TraditionalChinese, false},
    {"Pinyin keyboard", "keys/pinyin.txt", HmiComplexKeyboard::SimplifiedChinese, true},
    {"Zhuyin keyboard", "keys/zhuyin.txt", HmiComplexKeyboard::TraditionalChinese, true},
};

/// False, with a message, when the folder has no plugins.
bool registerEngines(const QDir& folder)
{
    bool some = false;
    const QFileInfoList files = folder.entryInfoList({QStringLiteral("*.so")}, QDir::Files, QDir::Name);
    for (const QFileInfo& file : files) {
        QPluginLoader loader(file.absoluteFilePath());
        auto* const plugin = qobject_cast<InputMethodEngineInterface*>(loader.instance());
        if (!plugin) {
            std::fprintf(stderr, "%s\n", qPrintable(loader.errorString()));
            continue;
        }
        const auto keys = loader.metaData().value(QLatin1String("MetaData")).toObject().value(QLatin1String("Keys"));
        const QJsonArray names = keys.toArray();
        for (const auto& key : names)
            some |= plugin->registerEngine(key.toString(), QCoreApplication::instance());
    }
    if (!some)
        std::fprintf(stderr, "There are no input engines in %s\n", qPrintable(folder.path()));
    return some;
}

/// Nothing when there is no engine, which the core has warned of.
std::optional<Accuracy> accuracyOf(const Set& set, const QList<Recording>& recordings)
{
    if (set.isTyped) {
        HmiComplexKeyboard keyboard;
        keyboard.setLanguage(set.language);
        if (qobject_cast<DummyEngine*>(keyboard.engine()))
            return std::nullopt;
        return Accuracy::of(*keyboard.engine(), recordings);
    }
    HmiHandwriting handwriting;
    handwriting.setLanguage(set.language);
    if (qobject_cast<DummyRecognizer*>(handwriting.recognizer()))
        return std::nullopt;
    return Accuracy::of(*handwriting.recognizer(), recordings);
}

QByteArray percent(int part, const Accuracy& accuracy)
{
    return QByteArray::number(100.0 * part / std::max(accuracy.count, 1), 'f', 0) + " %";
}

void print(const Set& set, const Accuracy& accuracy, bool withMisses)
{
    std::printf("| %-24s| %-26s| %10d | %6s | %7s | %7s | %7.2f |\n", set.engine, set.file, accuracy.count,
                percent(accuracy.first, accuracy).constData(), percent(accuracy.amongThree, accuracy).constData(),
                percent(accuracy.amongEight, accuracy).constData(), accuracy.milliseconds);
    if (withMisses && !accuracy.misses.isEmpty())
        std::printf("%s\n", qPrintable(accuracy.missesAsText()));
}

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("How well the input engines understand what was recorded."));
    parser.addHelpOption();
    parser.addOption(
        {QStringLiteral("misses"), QStringLiteral("List what was not the first candidate, and what was.")});
    parser.addPositionalArgument(QStringLiteral("plugins"), QStringLiteral("The folder with the plugins."));
    parser.addPositionalArgument(QStringLiteral("recordings"), QStringLiteral("The folder with strokes/ and keys/."));
    parser.process(application);
    const QStringList folders = parser.positionalArguments();
    if (folders.size() != 2)
        parser.showHelp(2);
    if (!registerEngines(QDir(folders.at(0))))
        return 1;

    std::printf("| %-24s| %-26s| %10s | %6s | %7s | %7s | %7s |\n", "engine", "recordings", "recorded", "first",
                "among 3", "among 8", "ms each");
    std::printf("|---|---|---|---|---|---|---|\n");
    bool complete = true;
    for (const Set& set : sets) {
        QString error;
        const QString file = QDir(folders.at(1)).filePath(QString::fromLatin1(set.file));
        const QList<Recording> recordings =
            set.isTyped ? Recordings::typed(file, &error) : Recordings::written(file, &error);
        if (recordings.isEmpty()) {
            std::fprintf(stderr, "%s\n",
                         qPrintable(error.isEmpty() ? file + QStringLiteral(": no recordings") : error));
            return 1;
        }
        if (const auto accuracy = accuracyOf(set, recordings))
            print(set, *accuracy, parser.isSet(QStringLiteral("misses")));
        else
            complete = false;
    }
    return complete ? 0 : 1;
}
