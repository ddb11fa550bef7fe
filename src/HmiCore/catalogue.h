// SPDX-License-Identifier: MIT
#pragma once

#include <QByteArray>
#include <QList>
#include <QString>
#include <QStringList>

QT_BEGIN_NAMESPACE
class QLocale;
class QTranslator;
QT_END_NAMESPACE

/// Compiled translation catalogues. QTranslator believes what they say about themselves and reads anywhere when they are
/// damaged, so their structure is checked before they are handed over.
namespace HmiCore::Catalogue {

/// What a file has that changes with its content.
struct Stamp
{
    quint64 device = 0;
    quint64 inode = 0;
    qint64 size = 0;
    qint64 changed = 0; ///< nanoseconds

    bool operator==(const Stamp& other) const;
};

/// A regular file that can be read; the path is empty when it is none.
struct File
{
    static File at(const QString& path);

    QString path;
    Stamp stamp;
    bool hasStamp = false; ///< not for what is built into the program
};

/// QTranslator::load(fileName, directory), which fails for damaged catalogues. GUI thread only, as the others.
bool load(QTranslator* translator, const QString& fileName, const QString& directory);

/// The same for a \a file that was found in \a directory and is named up to its first dot.
bool load(QTranslator* translator, const File& file, const QString& directory);

/// QTranslator::load(locale, fileName, prefix), which fails for damaged catalogues.
bool load(QTranslator* translator, const QLocale& locale, const QString& fileName, const QString& prefix);

/// The files in \a directory that have \a languageId, which may have wildcards, in their names, in the directory's order.
QList<File> filesNamedLike(const QString& languageId, const QString& directory);

/// Whether every place that a look-up in \a content can come to is inside of it. The names of catalogues that it builds on
/// are appended to \a dependencies.
bool isSound(const QByteArray& content, QStringList* dependencies);

} // namespace HmiCore::Catalogue
