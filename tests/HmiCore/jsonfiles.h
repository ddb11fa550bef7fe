// SPDX-License-Identifier: MIT
#pragma once

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QTest>

#include <sys/stat.h>

/// A folder of files for one test.
class Files
{
public:
    Files() { QVERIFY(m_folder.isValid()); }

    QString path() const { return m_folder.path(); }
    QString path(const QString& name) const { return m_folder.filePath(name); }

    void write(const QString& name, const QByteArray& content)
    {
        const QString file = path(name);
        QVERIFY(QDir().mkpath(QFileInfo(file).path()));
        QFile output(file);
        QVERIFY(output.open(QIODevice::WriteOnly));
        QCOMPARE(output.write(content), qint64(content.size()));
    }

    void remove(const QString& name) { QVERIFY(QFile::remove(path(name))); }

    /// A pipe that nobody writes to: opening it would wait for ever.
    void makePipe(const QString& name) { QCOMPARE(::mkfifo(QFile::encodeName(path(name)).constData(), 0600), 0); }

private:
    QTemporaryDir m_folder;
};

/// Rows of documents that are not what they should be; each kind of document says what it makes of them.
inline void addBadDocuments()
{
    enum Outcome { Missing, Unreadable, Malformed, Empty };
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<QString>("special"); // "missing", "pipe", "folder" or none
    QTest::addColumn<int>("outcome");     // 0 missing, 1 unreadable, 2 malformed, 3 read, but nothing in it
    QTest::newRow("missing") << QByteArray() << QStringLiteral("missing") << int(Missing);
    QTest::newRow("pipe") << QByteArray() << QStringLiteral("pipe") << int(Unreadable);
    QTest::newRow("folder") << QByteArray() << QStringLiteral("folder") << int(Unreadable);
    QTest::newRow("device") << QByteArray() << QStringLiteral("device") << int(Unreadable);
    QTest::newRow("too large") << QByteArray(17 * 1024 * 1024, ' ') << QString() << int(Unreadable);
    QTest::newRow("empty") << QByteArray() << QString() << int(Malformed);
    QTest::newRow("blank") << QByteArray(" \n\t ") << QString() << int(Malformed);
    QTest::newRow("truncated") << QByteArray("[{\"id\":\"1\",\"prop") << QString() << int(Malformed);
    QTest::newRow("not UTF-8") << QByteArray("[\"\xff\xfe\"]") << QString() << int(Malformed);
    QTest::newRow("garbage") << QByteArray("\x00\x01\x02\x03", 4) << QString() << int(Malformed);
    QTest::newRow("too deep") << QByteArray(2000, '[') + QByteArray(2000, ']') << QString() << int(Malformed);
    QTest::newRow("trailing") << QByteArray("[] []") << QString() << int(Malformed);
    QTest::newRow("a text") << QByteArray("\"text\"") << QString() << int(Malformed);
    QTest::newRow("an array of nothing") << QByteArray("[]") << QString() << int(Empty);
    QTest::newRow("an object") << QByteArray("{}") << QString() << int(Empty);
    QTest::newRow("wrong elements") << QByteArray("[1, \"x\", null, true, [], {}]") << QString() << int(Empty);
}

/// Lays the document of the current row down as \a name.
inline void layDown(Files& files, const QString& name, const QByteArray& content, const QString& special)
{
    if (special == QLatin1String("pipe"))
        files.makePipe(name);
    else if (special == QLatin1String("folder"))
        QVERIFY(QDir().mkpath(files.path(name)));
    else if (special == QLatin1String("device"))
        QVERIFY(QFile::link(QStringLiteral("/dev/zero"), files.path(name)));
    else if (special.isEmpty())
        files.write(name, content);
}
