// SPDX-License-Identifier: MIT
#include "elffile.h"
#include "logcapture.h"

#include <QFile>
#include <QRandomGenerator>
#include <QTemporaryDir>
#include <QTest>

namespace {

QByteArray radio()
{
    QFile file(QStringLiteral(FIXTURE_PLUGINS "/radio.so"));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

} // namespace

class ElfFileTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void aLibraryNamesWhatItNeeds()
    {
        const ElfFile file(QStringLiteral(FIXTURE_PLUGINS "/missing_function.so"));
        QCOMPARE(file.defect(), ElfFile::None);
        QCOMPARE(file.explanation(), QString());
        QVERIFY(file.undefinedSymbols().contains("_ZN7Missing16functionOfNobodyERK7QString"));
        QVERIFY(!file.undefinedSymbols().contains("__gmon_start__")); // weak
        QVERIFY(!file.libraries().filter(QStringLiteral("libHmiCore.so.1")).isEmpty());
    }

    void aForeignLibraryIsExplained()
    {
        QByteArray content = radio();
        content[5] = char(2);  // big endian
        content[18] = char(0); // PowerPC 64
        content[19] = char(21);
        QCOMPARE(explanationOf(content).section(QLatin1Char(';'), 0, 0),
                 QStringLiteral("It is built for another processor (PowerPC 64, 64 bits, big endian)"));
    }

    /// Whatever the bytes are, they are read within the file.
    void damagedHeadersAreSurvived()
    {
        const QByteArray good = radio();
        QVERIFY(good.size() > 64);
        const int sections = int(good.size()) - 64 * 40; // the section headers lie at the end
        QRandomGenerator random(20);
        int defects = 0;
        for (int round = 0; round < 500; ++round) {
            QByteArray content = good;
            for (int change = random.bounded(1, 6); change > 0; --change)
                content[random.bounded(2) == 0 ? random.bounded(6, 640) : random.bounded(sections, int(good.size()))] =
                    char(random.bounded(256));
            if (!explanationOf(content).isEmpty())
                ++defects;
        }
        QVERIFY(defects > 50);
        QVERIFY(defects < 500);
    }

    void everyLengthIsSurvived()
    {
        const QByteArray good = radio();
        for (int size = 0; size < 1000; size += 7)
            QVERIFY(!explanationOf(good.left(size)).isEmpty());
    }

private:
    QString explanationOf(const QByteArray& content)
    {
        QFile file(m_folder.filePath(QStringLiteral("library.so")));
        if (!file.open(QIODevice::WriteOnly) || file.write(content) != content.size())
            return QStringLiteral("cannot be written");
        file.close();
        return ElfFile(file.fileName()).explanation();
    }

    QTemporaryDir m_folder;
};

QTEST_GUILESS_MAIN(ElfFileTest)
#include "tst_elffile.moc"
