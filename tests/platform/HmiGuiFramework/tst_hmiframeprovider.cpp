// SPDX-License-Identifier: MIT
#include <HmiGuiFramework/HmiFrameProvider>

#include <QTest>

using HmiGuiFramework::HmiFrameProvider;

class HmiFrameProviderTest : public QObject
{
    Q_OBJECT

    static QImage filled(const QSize& size, Qt::GlobalColor color)
    {
        QImage image(size, QImage::Format_ARGB32_Premultiplied);
        image.fill(color);
        return image;
    }

private Q_SLOTS:
    void servesTheNewestFrameOfAName()
    {
        HmiFrameProvider provider;
        QSize size;
        HmiFrameProvider::setFrame(QStringLiteral("cover"), filled(QSize(8, 6), Qt::red));
        HmiFrameProvider::setFrame(QStringLiteral("cover"), filled(QSize(10, 4), Qt::blue));
        const QImage frame = provider.requestImage(QStringLiteral("cover?2"), &size, QSize());
        QCOMPARE(size, QSize(10, 4));
        QCOMPARE(frame.pixelColor(0, 0), QColor(Qt::blue));
    }

    void scalesToTheRequestedSize()
    {
        HmiFrameProvider provider;
        HmiFrameProvider::setFrame(QStringLiteral("cover"), filled(QSize(100, 100), Qt::red));
        QSize size;
        provider.requestImage(QStringLiteral("cover"), &size, QSize(10, 10));
        QCOMPARE(size, QSize(10, 10));
        provider.clearCache();
        QCOMPARE(HmiFrameProvider::frame(QStringLiteral("cover")).size(), QSize(100, 100));
    }

    void aScaledImageIsNotServedForANewerFrame()
    {
        HmiFrameProvider provider;
        HmiFrameProvider::setFrame(QStringLiteral("cover"), filled(QSize(100, 100), Qt::red));
        provider.requestImage(QStringLiteral("cover"), nullptr, QSize(10, 10));
        HmiFrameProvider::setFrame(QStringLiteral("cover"), filled(QSize(100, 100), Qt::blue));
        QCOMPARE(provider.requestImage(QStringLiteral("cover"), nullptr, QSize(10, 10)).pixelColor(5, 5),
                 QColor(Qt::blue));
    }

    void anUnknownNameIsATransparentPixel()
    {
        HmiFrameProvider provider;
        QSize size;
        const QImage image = provider.requestImage(QStringLiteral("nothing"), &size, QSize());
        QCOMPARE(size, QSize(1, 1));
        QCOMPARE(image.pixelColor(0, 0).alpha(), 0);
    }

    void aNullFrameRemovesTheName()
    {
        HmiFrameProvider::setFrame(QStringLiteral("cover"), filled(QSize(4, 4), Qt::red));
        HmiFrameProvider::setFrame(QStringLiteral("cover"), QImage());
        QVERIFY(HmiFrameProvider::frame(QStringLiteral("cover")).isNull());
    }

    void theOldestFramesGoWhenTheLimitIsReached()
    {
        const QSize size(1024, 1024); // 4 MiB
        for (int i = 0; i < 10; ++i)
            HmiFrameProvider::setFrame(QString::number(i), filled(size, Qt::red));
        QVERIFY(HmiFrameProvider::frame(QStringLiteral("0")).isNull());
        QVERIFY(!HmiFrameProvider::frame(QStringLiteral("9")).isNull());
    }

    void aFrameOverTheLimitIsNotKept()
    {
        HmiFrameProvider::setFrame(QStringLiteral("huge"), filled(QSize(4, 4), Qt::red));
        HmiFrameProvider::setFrame(QStringLiteral("huge"), QImage(4096, 4096, QImage::Format_ARGB32_Premultiplied));
        QVERIFY(HmiFrameProvider::frame(QStringLiteral("huge")).isNull());
    }
};

QTEST_MAIN(HmiFrameProviderTest)
#include "tst_hmiframeprovider.moc"
