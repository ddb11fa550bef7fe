// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiGuiFramework/AppSettings>
#include <HmiGuiFramework/HmiImageProvider>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QTest>

#include <memory>

using HmiGuiFramework::AppSettings;
using HmiGuiFramework::HmiImageProvider;

class HmiImageProviderTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { m_log = std::make_unique<LogCapture>(); }
    void cleanup() { m_log.reset(); }

    void drawsAnIconInTheColourAskedFor()
    {
        HmiImageProvider provider;
        QSize size;
        const QImage image = provider.requestImage(QStringLiteral("dot?color=%23ff8000"), &size, QSize(48, 48));
        QCOMPARE(size, QSize(48, 48));
        QCOMPARE(image.pixelColor(24, 24), QColor(0xff, 0x80, 0x00));
    }

    void aTranslucentColourMakesATranslucentIcon()
    {
        HmiImageProvider provider;
        const QImage image = provider.requestImage(QStringLiteral("dot?color=%2380ff0000"), nullptr, QSize(8, 8));
        QVERIFY(qAbs(image.pixelColor(4, 4).alpha() - 0x80) <= 1);
        QCOMPARE(image.pixelColor(4, 4).red(), 0xff);
    }

    void hasItsOwnSizeWithoutARequestedOne()
    {
        HmiImageProvider provider;
        QCOMPARE(provider.requestImage(QStringLiteral("dot"), nullptr, QSize()).size(), QSize(24, 24));
    }

    void oneSideIsEnough()
    {
        HmiImageProvider provider;
        QCOMPARE(provider.requestImage(QStringLiteral("dot"), nullptr, QSize(60, 0)).size(), QSize(60, 60));
        QCOMPARE(provider.requestImage(QStringLiteral("dot"), nullptr, QSize(0, 30)).size(), QSize(30, 30));
    }

    void hugeRequestsAreBounded()
    {
        HmiImageProvider provider;
        QVERIFY(provider.requestImage(QStringLiteral("dot"), nullptr, QSize(1000000, 1000000)).width() <= 2048);
    }

    void unknownAndUnreadableIconsGiveOneWarningAndAnEmptyImage_data()
    {
        QTest::addColumn<QString>("id");
        QTest::addColumn<QString>("warning");
        QTest::newRow("unknown") << QStringLiteral("nothing") << QStringLiteral("icon nothing does not exist");
        QTest::newRow("no name") << QString() << QStringLiteral("icon  does not exist");
        QTest::newRow("outside of the folder")
            << QStringLiteral("../gui/data/views") << QStringLiteral("icon ../gui/data/views does not exist");
        QTest::newRow("not a picture") << QStringLiteral("broken") << QStringLiteral("icon broken cannot be drawn");
    }

    void unknownAndUnreadableIconsGiveOneWarningAndAnEmptyImage()
    {
        QFETCH(QString, id);
        QFETCH(QString, warning);
        HmiImageProvider provider;
        QVERIFY(provider.requestImage(id, nullptr, QSize()).isNull());
        QVERIFY(m_log->takeOne(QtWarningMsg, warning));
        m_log->take(QStringLiteral("qt.svg"), QtWarningMsg);
    }

    void productsIconsAreFoundInItsFolder()
    {
        const QTemporaryDir folder;
        AppSettings::mainFolderPath = folder.path() + QLatin1Char('/');
        QDir(folder.path()).mkdir(QStringLiteral("icons"));
        QVERIFY(QFile::copy(QStringLiteral(":/icons/dot.svg"), folder.path() + QStringLiteral("/icons/own.svg")));
        HmiImageProvider provider;
        QVERIFY(!provider.requestImage(QStringLiteral("own"), nullptr, QSize()).isNull());
        AppSettings::mainFolderPath.clear();
    }

    void theCacheIsBoundedAndCanBeCleared()
    {
        HmiImageProvider provider;
        for (int side = 500; side < 520; ++side) // about 1 MiB each
            provider.requestImage(QStringLiteral("dot"), nullptr, QSize(side, side));
        QVERIFY(provider.cachedBytes() > HmiImageProvider::cacheLimit / 2);
        QVERIFY(provider.cachedBytes() <= HmiImageProvider::cacheLimit);
        provider.clearCache();
        QCOMPARE(provider.cachedBytes(), 0);
    }

    void repeatedRequestsAreServedFromTheCache()
    {
        HmiImageProvider provider;
        const QImage first = provider.requestImage(QStringLiteral("dot"), nullptr, QSize(64, 64));
        QCOMPARE(provider.requestImage(QStringLiteral("dot"), nullptr, QSize(64, 64)).cacheKey(), first.cacheKey());
    }

private:
    std::unique_ptr<LogCapture> m_log;
};

QTEST_MAIN(HmiImageProviderTest)
#include "tst_hmiimageprovider.moc"
