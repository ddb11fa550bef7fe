// SPDX-License-Identifier: MIT
#include "catalogues.h"

#include "catalogue.h"

#include <QDataStream>
#include <QLocale>
#include <QTranslator>
#include <QtEndian>

#include <algorithm>
#include <random>

using namespace HmiCore;

namespace {

QString text(const char* utf8)
{
    return QString::fromUtf8(utf8);
}

bool isSound(const QByteArray& content)
{
    QStringList dependencies;
    return Catalogue::isSound(content, &dependencies);
}

QByteArray number32(quint32 number)
{
    QByteArray bytes(4, '\0');
    qToBigEndian(number, bytes.data());
    return bytes;
}

QByteArray dependencySection(const QStringList& names)
{
    QByteArray strings;
    QDataStream stream(&strings, QIODevice::WriteOnly);
    for (const QString& name : names)
        stream << name;
    return QByteArray("\x96", 1) + number32(quint32(strings.size())) + strings;
}

} // namespace

class CatalogueTest : public QObject
{
    Q_OBJECT
    Files files;
    QByteArray small;
    QByteArray large;

    QString lay(const QString& name, const QByteArray& content)
    {
        files.write(name, content);
        return files.path(name);
    }

private Q_SLOTS:
    void initTestCase()
    {
        small = compileCatalogue(text("Screen"), {{text("Radio"), text("Rundfunk")}, {text("Phone"), QString()}});
        large = compileCatalogue(text("Screen"), {{text("Radio"), text("Rundfunk")}}, 300);
        QVERIFY(small.size() > 100);
        QVERIFY(large.size() > 10000);
    }

    void realCataloguesAreSound()
    {
        QVERIFY(isSound(small));
        QVERIFY(isSound(large));
    }

    void otherFilesAreNot()
    {
        QVERIFY(!isSound(QByteArray()));
        QVERIFY(!isSound("text"));
        QVERIFY(!isSound(QByteArray(1000, '\0')));
        QVERIFY(!isSound(QByteArray(1000, '\xff')));
    }

    void everyTruncationIsRefusedOrHarmless()
    {
        QTranslator translator;
        for (int size = 0; size < small.size(); ++size) {
            const QString file = lay(text("cut_de.qm"), small.left(size));
            if (!Catalogue::load(&translator, file, QString()))
                continue;
            translator.translate("Screen", "Radio");
            translator.translate("Screen", "%n file(s)", nullptr, 3);
        }
        for (const int size : {20, 40, 60, int(small.size()) / 2})
            QVERIFY2(!isSound(small.left(size)), qPrintable(QString::number(size)));
    }

    /// What is taken for sound must not crash; that much is left of the others tells that the check does not refuse everything.
    void mutationsNeverCrash_data()
    {
        QTest::addColumn<bool>("useLarge");
        QTest::addColumn<int>("count");
        QTest::newRow("small") << false << 8000;
        QTest::newRow("large") << true << 4000;
    }
    void mutationsNeverCrash()
    {
        QFETCH(bool, useLarge);
        QFETCH(int, count);
        const QByteArray original = useLarge ? large : small;
        std::mt19937 random(useLarge ? 1 : 2);
        QTranslator translator;
        int loaded = 0;
        for (int i = 0; i < count; ++i) {
            QByteArray changed = original;
            for (uint change = 1 + random() % 12; change > 0; --change)
                changed[int(random() % uint(changed.size()))] = char(random());
            const QString file =
                lay(QStringLiteral("mutation%1_de.qm").arg(i), changed); // writing over one waits for the disk
            const bool isLoaded = Catalogue::load(&translator, file, QString());
            QVERIFY(QFile::remove(file));
            if (!isLoaded)
                continue;
            ++loaded;
            for (const char* const source : {"Radio", "Phone", "Filler number 7", "Filler number 299", "nothing"})
                for (const char* const comment : {"", "c"})
                    translator.translate("Screen", source, comment);
            for (const int n : {0, 1, 2, 5, 11, 21, 100})
                translator.translate("Screen", "%n file(s)", nullptr, n);
            translator.translate("Other", "Radio");
        }
        qInfo("%d of %d were loaded", loaded, count);
        QVERIFY(loaded > count / 100);
        QVERIFY(loaded < count);
    }

    void refusedMeansEmpty()
    {
        QTranslator translator;
        QVERIFY(Catalogue::load(&translator, lay(text("good.qm"), small), QString()));
        QCOMPARE(translator.translate("Screen", "Radio"), text("Rundfunk"));
        QByteArray damaged = small;
        const int messages = int(damaged.indexOf(QByteArray("\x69\0\0", 3)));
        QVERIFY(messages > 0);
        damaged.replace(messages + 5, 20, QByteArray(20, '\x03'));
        QVERIFY(!Catalogue::load(&translator, lay(text("bad.qm"), damaged), QString()));
        QVERIFY(translator.isEmpty());
        QVERIFY(!Catalogue::load(&translator, text("none"), files.path()));
    }

    void aFileThatChangedIsLookedAtAgain()
    {
        QTranslator translator;
        for (int i = 0; i < 50; ++i) {
            QVERIFY(Catalogue::load(&translator, lay(text("again.qm"), small), QString()));
            QByteArray damaged = small;
            damaged.replace(20, 8, QByteArray(8, '\x7f'));
            QVERIFY(!Catalogue::load(&translator, lay(text("again.qm"), damaged), QString()));
        }
    }

    void theNamesAreThoseOfTheTranslator_data()
    {
        QTest::addColumn<QString>("present");
        QTest::addColumn<QString>("asked");
        QTest::addColumn<bool>("found");
        QTest::newRow("with suffix") << "n_de_DE.qm"
                                     << "n_de_DE" << true;
        QTest::newRow("whole name") << "n_de_DE.qm"
                                    << "n_de_DE.qm" << true;
        QTest::newRow("without suffix") << "n_de_DE"
                                        << "n_de_DE" << true;
        QTest::newRow("shortened") << "n_de.qm"
                                   << "n_de_DE" << true;
        QTest::newRow("much shortened") << "n.qm"
                                        << "n_de_DE" << true;
        QTest::newRow("longer") << "n_de_DE_x.qm"
                                << "n_de_DE" << false;
    }
    void theNamesAreThoseOfTheTranslator()
    {
        QFETCH(QString, present);
        QFETCH(QString, asked);
        QFETCH(bool, found);
        Files folder;
        folder.write(present, small);
        QTranslator ours;
        QTranslator stock;
        QCOMPARE(stock.load(asked, folder.path()), found);
        QCOMPARE(Catalogue::load(&ours, asked, folder.path()), found);
        QCOMPARE(ours.filePath(), stock.filePath());
        // And a damaged one there is seen.
        folder.write(present, small.left(small.size() / 2));
        QVERIFY(!Catalogue::load(&ours, asked, folder.path()));
    }

    void theLanguagesAreThoseOfTheTranslator_data()
    {
        QTest::addColumn<QString>("present");
        QTest::addColumn<QString>("locale");
        QTest::addColumn<bool>("found");
        QTest::newRow("exact") << "m_de_DE.qm"
                               << "de_DE" << true;
        QTest::newRow("language") << "m_de.qm"
                                  << "de_DE" << true;
        QTest::newRow("lower case") << "m_de_de.qm"
                                    << "de_DE" << true;
        QTest::newRow("script") << "m_zh_Hans_CN.qm"
                                << "zh_CN" << true;
        QTest::newRow("territory of Chinese") << "m_zh_TW.qm"
                                              << "zh_TW" << true;
        QTest::newRow("nothing appended") << "m_.qm"
                                          << "de_DE" << false;
        QTest::newRow("suffix alone") << "m.qm"
                                      << "de_DE" << false;
        QTest::newRow("prefix alone") << "m_"
                                      << "de_DE" << true;
        QTest::newRow("bare name") << "m"
                                   << "de_DE" << true;
        QTest::newRow("other") << "m_fr.qm"
                               << "de_DE" << false;
    }
    void theLanguagesAreThoseOfTheTranslator()
    {
        QFETCH(QString, present);
        QFETCH(QString, locale);
        QFETCH(bool, found);
        Files folder;
        folder.write(present, small);
        QTranslator ours;
        QTranslator stock;
        QCOMPARE(stock.load(QLocale(locale), folder.path(text("m")), text("_"), QString(), QString()), found);
        QCOMPARE(Catalogue::load(&ours, QLocale(locale), folder.path(text("m")), text("_")), found);
        QCOMPARE(ours.filePath(), stock.filePath());
        folder.write(present, small.left(small.size() / 2));
        QVERIFY(!Catalogue::load(&ours, QLocale(locale), folder.path(text("m")), text("_")));
    }

    void whatACatalogueBuildsOnIsLookedAtToo()
    {
        const QByteArray meta = small.left(16) + dependencySection({text("part_de")});
        QTranslator translator;
        Files folder;
        folder.write(text("meta_de.qm"), meta);
        folder.write(text("part_de.qm"), small);
        QVERIFY(Catalogue::load(&translator, text("meta_de"), folder.path()));
        QCOMPARE(translator.translate("Screen", "Radio"), text("Rundfunk"));
        QByteArray damaged = small;
        damaged.replace(30, 8, QByteArray(8, '\x7f'));
        folder.write(text("part_de.qm"), damaged);
        QVERIFY(!Catalogue::load(&translator, text("meta_de"), folder.path()));
        folder.write(text("part_de.qm"), meta); // builds on itself
        QVERIFY(!Catalogue::load(&translator, text("meta_de"), folder.path()));
    }
};

QTEST_GUILESS_MAIN(CatalogueTest)
#include "tst_catalogue.moc"
