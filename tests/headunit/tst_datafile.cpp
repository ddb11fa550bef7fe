// SPDX-License-Identifier: MIT
#include "datafile.h"

#include <QFile>
#include <QJsonArray>
#include <QTemporaryDir>
#include <QTest>

#include <sys/stat.h>

class DataFileTest : public QObject
{
    Q_OBJECT

    QTemporaryDir m_folder;

    QString write(const QByteArray& content)
    {
        const QString name = m_folder.filePath(QStringLiteral("data.json"));
        QFile file(name);
        const bool written =
            file.open(QIODevice::WriteOnly | QIODevice::Truncate) && file.write(content) == content.size();
        return written ? name : QString();
    }

    static QString complaint(const QString& file)
    {
        QString error;
        const QJsonObject object = DataFile::read(file, &error);
        return object.isEmpty() ? error : QStringLiteral("read");
    }

private Q_SLOTS:
    void anObjectIsReadAsItIs()
    {
        QString error = QStringLiteral("of before");
        const QJsonObject object = DataFile::read(write("{\"a\": [1]}"), &error);
        QCOMPARE(error, QString());
        QCOMPARE(object.value(QLatin1String("a")).toArray().at(0).toInt(), 1);
        QCOMPARE(DataFile::read(write("{}"), &error), QJsonObject());
        QCOMPARE(error, QString());
    }

    void whatIsNoObjectIsNamed_data()
    {
        QTest::addColumn<QByteArray>("content");
        QTest::addColumn<QString>("problem");
        QTest::newRow("empty") << QByteArray() << QStringLiteral("at byte 0");
        QTest::newRow("cut") << QByteArray("{\"a\": ") << QStringLiteral("at byte 6");
        QTest::newRow("a list") << QByteArray("[]") << QStringLiteral(": is no object");
        QTest::newRow("too large") << QByteArray("{}").leftJustified(int(DataFile::maximumSize) + 1, ' ')
                                   << QStringLiteral(": has more than 4194304 bytes");
    }

    void whatIsNoObjectIsNamed()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, problem);
        const QString file = write(content);
        const QString said = complaint(file);
        QVERIFY2(said.startsWith(file + QStringLiteral(": ")) && said.endsWith(problem), qPrintable(said));
    }

    void theLargestIsRead()
    {
        QString error;
        DataFile::read(write(QByteArray("{}").leftJustified(int(DataFile::maximumSize), ' ')), &error);
        QCOMPARE(error, QString());
    }

    void whatCannotEndIsNotOpened()
    {
        const QString pipe = m_folder.filePath(QStringLiteral("pipe"));
        QCOMPARE(::mkfifo(QFile::encodeName(pipe).constData(), S_IRUSR | S_IWUSR), 0);
        QCOMPARE(complaint(pipe), pipe + QStringLiteral(": is no regular file"));
        QCOMPARE(complaint(QStringLiteral("/dev/zero")), QStringLiteral("/dev/zero: is no regular file"));
        QCOMPARE(complaint(m_folder.path()), m_folder.path() + QStringLiteral(": is no regular file"));
    }

    void aMissingFileIsNamed()
    {
        const QString file = m_folder.filePath(QStringLiteral("nowhere"));
        QVERIFY(complaint(file).startsWith(file + QStringLiteral(": ")));
    }
};

QTEST_GUILESS_MAIN(DataFileTest)
#include "tst_datafile.moc"
