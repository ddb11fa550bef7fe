// SPDX-License-Identifier: MIT
// What lies in a plugin folder: the scan of its metadata, and the look at its headers that tells why it cannot be loaded.
#include "fuzzing.h"

#include "elffile.h"
#include "pluginfile.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>

using namespace HmiCore;
using Fuzzing::check;

namespace {

const char moduleId[] = "com.kest.ivi.ModuleInterface";
const char engineId[] = "com.kest.hmi.InputMethodEngineInterface";

/// Qt wants a file with a name. Where it can be, it is in memory.
QDir folder()
{
    static const QString memory = QStringLiteral("/dev/shm");
    static const QTemporaryDir folder((QFileInfo(memory).isWritable() ? memory : QDir::tempPath())
                                      + QStringLiteral("/fuzz-XXXXXX"));
    return QDir(folder.path());
}

void scan(const QString& fileName, const QByteArray& content)
{
    const PluginFile plugin(folder(), fileName);
    for (const char* const id : {moduleId, engineId}) {
        const bool isOne = plugin.hasInterfaceId(id);
        check(!isOne || content.contains(id), "only what names the interface is a plugin for it");
        check(!isOne || content.contains("QTMETADATA"), "only what has metadata is a plugin");
    }
    check(!plugin.hasInterfaceId(moduleId) || !plugin.hasInterfaceId(engineId), "a plugin is for one interface");
    const bool isEmpty = plugin.name().isEmpty() && plugin.keys().isEmpty();
    check(isEmpty || plugin.hasOwnMetaData(), "names and keys are the plugin's own");
    const PluginFile again(folder(), fileName);
    check(again.keys() == plugin.keys() && again.name() == plugin.name(), "the scan is repeatable");
}

void look(const QString& path, const QByteArray& content)
{
    const ElfFile file(path);
    const bool isGood = file.defect() == ElfFile::None;
    check(isGood == file.explanation().isEmpty(), "a defect is explained", file.explanation());
    check(isGood || (file.libraries().isEmpty() && file.undefinedSymbols().isEmpty()),
          "nothing of a defective file is told");
    check(!isGood
              || content.startsWith("\x7f"
                                    "ELF"),
          "good files are libraries");
    const QList<QByteArray> symbols = file.undefinedSymbols();
    for (const QByteArray& symbol : symbols)
        check(content.contains(symbol), "symbols stand in the file", QString::fromLatin1(symbol));
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
    const QString fileName = QStringLiteral("plugin.so");
    const QString path = folder().absoluteFilePath(fileName);
    QFile file(path);
    check(file.open(QIODevice::WriteOnly) && file.write(content) == content.size(), "a file can be written");
    file.close();
    scan(fileName, content);
    look(path, content);
    return 0;
}
