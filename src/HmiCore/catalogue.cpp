// SPDX-License-Identifier: MIT
#include "catalogue.h"

#include <QDataStream>
#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>
#include <QHash>
#include <QLocale>
#include <QTranslator>
#include <QtEndian>

#include <cstring>
#include <ctime>
#include <sys/stat.h>
#include <unistd.h>

namespace HmiCore::Catalogue {

namespace {

constexpr qint64 maximumSize = 64 * 1024 * 1024; ///< bytes
constexpr int deepestDependency = 8;
constexpr uchar magic[16] = {0x3c, 0xb8, 0x64, 0x18, 0xca, 0xef, 0x9c, 0x95,
                             0xcd, 0x21, 0x1c, 0xbf, 0x60, 0xa1, 0xbd, 0xdd};

/// Parts of a catalogue, each with a byte that names it and four that tell its length.
enum Section : uchar { Contexts = 0x2f, Hashes = 0x42, Messages = 0x69, Dependencies = 0x96 };

/// Parts of a message. All but the end and the obsolete ones are followed by their length.
enum Tag : uchar { End = 1, Translation = 3, Obsolete = 5, SourceText = 6, Context = 7, Comment = 8 };

constexpr quint32 noTranslation = 0xffffffff;

struct Bytes
{
    const uchar* begin = nullptr;
    qint64 size = 0;

    bool has(qint64 offset, qint64 count) const { return offset >= 0 && count >= 0 && offset <= size - count; }
    quint32 number32(qint64 offset) const { return qFromBigEndian<quint32>(begin + offset); }
    quint16 number16(qint64 offset) const { return qFromBigEndian<quint16>(begin + offset); }
};

/// The table that tells whether a context is in the catalogue: places in a list of names, by the hash of the name.
bool areContextsSound(const Bytes& contexts)
{
    if (contexts.size == 0)
        return true;
    const qint64 buckets = contexts.size >= 2 ? contexts.number16(0) : 0;
    const qint64 names = 2 + 2 * buckets;
    if (buckets == 0 || !contexts.has(0, names))
        return false;
    for (qint64 bucket = 0; bucket < buckets; ++bucket) {
        const qint64 place = contexts.number16(2 + 2 * bucket);
        if (place == 0)
            continue;
        for (qint64 at = names + 2 * place;;) {
            if (!contexts.has(at, 1))
                return false;
            const qint64 length = contexts.begin[at];
            if (length == 0)
                break;
            at += 1 + length;
        }
    }
    return true;
}

/// Whether the message at \a at comes to an end inside of the section; takes the number of its parts from \a budget.
bool isMessageSound(const Bytes& messages, qint64 at, qint64* budget)
{
    while (--*budget > 0) {
        if (!messages.has(at, 1))
            return false;
        const uchar tag = messages.begin[at++];
        if (tag == Obsolete) {
            at += 4;
            continue;
        }
        if (tag != Translation && tag != SourceText && tag != Context && tag != Comment)
            return true; // its end, or what ends the look-up
        if (!messages.has(at, 4))
            return false;
        const quint32 length = messages.number32(at);
        at += 4;
        if (tag == Translation && length == noTranslation)
            continue;
        if (tag == Translation && length % 2 != 0)
            return false; // half a character
        if (!messages.has(at, length))
            return false;
        at += length;
    }
    return false;
}

bool areMessagesSound(const Bytes& hashes, const Bytes& messages)
{
    if (hashes.size % 8 != 0)
        return false;
    qint64 budget = 4 * messages.size + 1; // a part has at least a byte, and each message is reached a few times
    for (qint64 entry = 0; entry < hashes.size; entry += 8)
        if (!isMessageSound(messages, hashes.number32(entry + 4), &budget))
            return false;
    return true;
}

bool areDependenciesSound(const Bytes& section, QStringList* dependencies)
{
    QDataStream stream(QByteArray::fromRawData(reinterpret_cast<const char*>(section.begin), int(section.size)));
    while (!stream.atEnd()) {
        QString name;
        stream >> name;
        if (stream.status() != QDataStream::Ok || dependencies->size() >= 64)
            return false;
        dependencies->append(name);
    }
    return true;
}

constexpr qint64 second = 1000000000;

/// False for what is not a file or directory, as \a kind says, of the file system.
bool stampOf(const QString& path, mode_t kind, Stamp* stamp)
{
    struct stat status;
    if (::stat(QFile::encodeName(path).constData(), &status) != 0 || (status.st_mode & S_IFMT) != kind)
        return false;
    *stamp = {status.st_dev, status.st_ino, status.st_size,
              qint64(status.st_ctim.tv_sec) * second + status.st_ctim.tv_nsec};
    return true;
}

/// A file that changed just now may change again without a later time.
bool isSettled(const Stamp& stamp)
{
    timespec now;
    ::clock_gettime(CLOCK_REALTIME, &now);
    return stamp.changed < (qint64(now.tv_sec) - 2) * second;
}

/// The same catalogues are loaded with each change of the language.
QHash<QString, Stamp>& soundFiles()
{
    static QHash<QString, Stamp> files;
    return files;
}

bool isKnown(const File& file)
{
    const auto known = soundFiles().constFind(file.path);
    return file.hasStamp && known != soundFiles().constEnd() && *known == file.stamp;
}

bool isThere(const QString& path, File* file)
{
    *file = File::at(path);
    return !file->path.isEmpty();
}

QStringList list(const QString& languageId, const QString& directory)
{
    QStringList paths;
    QDirIterator entries(directory, {QLatin1Char('*') + languageId + QLatin1Char('*')},
                         QDir::AllEntries | QDir::System | QDir::NoDotAndDotDot);
    while (entries.hasNext())
        paths.append(entries.next());
    return paths;
}

/// With and without suffix.
bool isThereAs(const QString& path, File* file)
{
    return isThere(path + QLatin1String(".qm"), file) || isThere(path, file);
}

/// What QTranslator takes for a file name: that, then what is left of it when it is shortened at `_` and `.`.
File find(QString fileName, const QString& directory)
{
    const QString folder =
        QDir::isRelativePath(fileName) && !directory.isEmpty() ? directory + QLatin1Char('/') : QString();
    File file;
    for (int end = int(fileName.size()); end > 0;) {
        fileName.truncate(end);
        if (isThereAs(folder + fileName, &file))
            return file;
        end = int(qMax(fileName.lastIndexOf(QLatin1Char('_')), fileName.lastIndexOf(QLatin1Char('.'))));
    }
    return File();
}

/// What it takes for a locale: each of its languages, then those without their last part, then none.
File find(const QLocale& locale, const QString& fileName, const QString& prefix)
{
    QStringList languages;
    const QStringList wanted = locale.uiLanguages();
    for (QString language : wanted) {
        language.replace(QLatin1Char('-'), QLatin1Char('_'));
        languages << language << language.toLower();
    }
    const int exact = int(languages.size());
    for (int i = 0; i < exact; ++i)
        for (QString language = languages.at(i); language.contains(QLatin1Char('_'));) {
            language.truncate(language.lastIndexOf(QLatin1Char('_')));
            languages << language;
        }
    File file;
    for (const QString& language : qAsConst(languages))
        if (isThereAs(fileName + prefix + language, &file))
            return file;
    return isThere(fileName + prefix, &file) || isThere(fileName, &file) ? file : File();
}

bool isFileSound(const File& file, const QString& directory, int depth);

bool checkFile(const File& file, const QString& directory, int depth)
{
    QFile content(file.path);
    if (content.size() > maximumSize || !content.open(QIODevice::ReadOnly))
        return false;
    QStringList dependencies;
    if (!isSound(content.readAll(), &dependencies))
        return false;
    for (const QString& dependency : qAsConst(dependencies)) {
        const File found = find(dependency, directory);
        if (!found.path.isEmpty() && !isFileSound(found, directory, depth + 1))
            return false;
    }
    if (file.hasStamp && dependencies.isEmpty() && isSettled(file.stamp))
        soundFiles().insert(file.path, file.stamp);
    return true;
}

bool isFileSound(const File& file, const QString& directory, int depth)
{
    if (depth > deepestDependency)
        return false;
    return isKnown(file) || checkFile(file, directory, depth);
}

template <typename Load>
bool loadSound(QTranslator* translator, const File& file, const QString& directory, Load load)
{
    if (!file.path.isEmpty() && isFileSound(file, directory, 0) && load() && translator->filePath() == file.path)
        return true;
    if (!translator->isEmpty()) [[maybe_unused]]
        const bool cleared = translator->load(QString()); // as after any load that fails
    return false;
}

} // namespace

bool Stamp::operator==(const Stamp& other) const
{
    return device == other.device && inode == other.inode && size == other.size && changed == other.changed;
}

File File::at(const QString& path)
{
    File file;
    file.path = path;
    file.hasStamp = stampOf(path, S_IFREG, &file.stamp);
    if (isKnown(file)) // it was readable then, and access would have changed its stamp
        return file;
    const bool isReadable = file.hasStamp ? ::access(QFile::encodeName(path).constData(), R_OK) == 0
                                          : path.startsWith(QLatin1Char(':')) && QFileInfo(path).isFile();
    return isReadable ? file : File();
}

QList<File> filesNamedLike(const QString& languageId, const QString& directory)
{
    struct Listing
    {
        Stamp stamp;
        QStringList paths;
    };
    static QHash<QString, Listing> listings; // a directory's stamp changes with its entries
    Stamp stamp;
    const bool hasStamp = stampOf(directory, S_IFDIR, &stamp);
    const QString key = languageId + QLatin1Char('\n') + directory;
    auto listing = listings.constFind(key);
    const bool isListed = hasStamp && listing != listings.constEnd() && listing->stamp == stamp;
    const QStringList paths = isListed ? listing->paths : list(languageId, directory);
    if (!isListed && hasStamp && isSettled(stamp))
        listings.insert(key, {stamp, paths});
    QList<File> files;
    for (const QString& path : paths) {
        const File file = File::at(path);
        if (!file.path.isEmpty())
            files.append(file);
    }
    return files;
}

bool isSound(const QByteArray& content, QStringList* dependencies)
{
    const Bytes all{reinterpret_cast<const uchar*>(content.constData()), content.size()};
    if (!all.has(0, sizeof magic) || std::memcmp(all.begin, magic, sizeof magic) != 0)
        return false;
    Bytes contexts;
    Bytes hashes;
    Bytes messages;
    for (qint64 at = sizeof magic; at < all.size;) {
        if (!all.has(at, 5))
            return false;
        const uchar section = all.begin[at];
        const qint64 length = all.number32(at + 1);
        at += 5;
        if (section == 0 || length == 0 || !all.has(at, length))
            return false;
        const Bytes part{all.begin + at, length};
        if (section == Contexts)
            contexts = part;
        else if (section == Hashes)
            hashes = part;
        else if (section == Messages)
            messages = part;
        else if (section == Dependencies && !areDependenciesSound(part, dependencies))
            return false;
        at += length;
    }
    return areContextsSound(contexts) && areMessagesSound(hashes, messages);
}

bool load(QTranslator* translator, const QString& fileName, const QString& directory)
{
    return loadSound(translator, find(fileName, directory), directory,
                     [&] { return translator->load(fileName, directory); });
}

bool load(QTranslator* translator, const File& file, const QString& directory)
{
    const QString fileName = QFileInfo(file.path).fileName();
    const QString baseName = fileName.left(fileName.indexOf(QLatin1Char('.')));
    if (fileName.size() != baseName.size() + 3 || !fileName.endsWith(QLatin1String(".qm")))
        return load(translator, baseName, directory); // it may be another file
    return loadSound(translator, file, directory, [&] { return translator->load(baseName, directory); });
}

bool load(QTranslator* translator, const QLocale& locale, const QString& fileName, const QString& prefix)
{
    return loadSound(translator, find(locale, fileName, prefix), QString(),
                     [&] { return translator->load(locale, fileName, prefix, QString(), QString()); });
}

} // namespace HmiCore::Catalogue
