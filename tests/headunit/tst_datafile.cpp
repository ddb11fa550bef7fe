// SPDX-License-Identifier: MIT
#include "datafile.h"
#include "scratchfile.h"

#include <QFile>
#include <QJsonArray>
#include <QTest>

#include <sys/stat.h>

class DataFileTest : public QObject
{
    Q_OBJECT

    const ScratchFile m_file{QStringLiteral("data.json")};

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
        const QJsonObject object = DataFile::read(m_file.with("{\"a\": [1]}"), &error);
        QCOMPARE(error, QString());
        QCOMPARE(object.value(QLatin1String("a")).toArray().at(0).toInt(), 1);
        QCOMPARE(DataFile::read(m_file.with("{}"), &error), QJsonObject());
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
        const QString file = m_file.with(content);
        const QString said = complaint(file);
        QVERIFY2(said.startsWith(file + QStringLiteral(": ")) && said.endsWith(problem), qPrintable(said));
    }

    void theLargestIsRead()
    {
        QString error;
        DataFile::read(m_file.with(QByteArray("{}").leftJustified(int(DataFile::maximumSize), ' ')), &error);
        QCOMPARE(error, QString());
    }

    void whatCannotEndIsNotOpened()
    {
        const QString pipe = m_file.folder() + QStringLiteral("/pipe");
        QCOMPARE(::mkfifo(QFile::encodeName(pipe).constData(), S_IRUSR | S_IWUSR), 0);
        QCOMPARE(complaint(pipe), pipe + QStringLiteral(": is no regular file"));
        QCOMPARE(complaint(QStringLiteral("/dev/zero")), QStringLiteral("/dev/zero: is no regular file"));
        QCOMPARE(complaint(m_file.folder()), m_file.folder() + QStringLiteral(": is no regular file"));
    }

    void aMissingFileIsNamed()
    {
        const QString file = m_file.folder() + QStringLiteral("/nowhere");
        QVERIFY(complaint(file).startsWith(file + QStringLiteral(": ")));
    }
};

QTEST_GUILESS_MAIN(DataFileTest)
#include "tst_datafile.moc"
