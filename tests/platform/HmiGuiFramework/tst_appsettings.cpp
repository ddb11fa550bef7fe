// SPDX-License-Identifier: MIT
#include <HmiGuiFramework/AppSettings>

#include <QMetaProperty>
#include <QSignalSpy>
#include <QTest>

using HmiGuiFramework::AppSettings;

class AppSettingsTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void instanceBelongsToTheApplication()
    {
        QCOMPARE(AppSettings::instance(), AppSettings::instance());
        QCOMPARE(AppSettings::instance()->parent(), QCoreApplication::instance());
    }

    void settersNotifyOnceAndOnlyOnChange_data()
    {
        QTest::addColumn<QByteArray>("name");
        QTest::addColumn<QVariant>("value");
        QTest::newRow("windowSize") << QByteArray("windowSize") << QVariant(QSize(800, 480));
        QTest::newRow("fullScreen") << QByteArray("fullScreen") << QVariant(true);
        QTest::newRow("rightToLeft") << QByteArray("rightToLeft") << QVariant(true);
        QTest::newRow("animations") << QByteArray("animations") << QVariant(false);
        QTest::newRow("themeFile") << QByteArray("themeFile") << QVariant(QStringLiteral("theme.json"));
        QTest::newRow("uiVariation") << QByteArray("uiVariation") << QVariant(QStringLiteral("compact"));
        QTest::newRow("viewCacheSize") << QByteArray("viewCacheSize") << QVariant(9);
        QTest::newRow("idleTimeout") << QByteArray("idleTimeout") << QVariant(1234);
    }

    void settersNotifyOnceAndOnlyOnChange()
    {
        QFETCH(QByteArray, name);
        QFETCH(QVariant, value);
        const char* const property = name.constData();
        auto* const settings = AppSettings::instance();
        const auto* const meta = settings->metaObject();
        QSignalSpy changed(settings, meta->property(meta->indexOfProperty(property)).notifySignal());
        QVERIFY(settings->property(property) != value);
        settings->setProperty(property, value);
        settings->setProperty(property, value);
        QCOMPARE(changed.count(), 1);
        QCOMPARE(settings->property(property), value);
    }

    void uselessValuesAreBounded()
    {
        auto* const settings = AppSettings::instance();
        settings->setWindowSize(QSize(800, 480));
        settings->setWindowSize(QSize(0, 10));
        QCOMPARE(settings->windowSize(), QSize(800, 480));
        settings->setViewCacheSize(-1);
        QCOMPARE(settings->viewCacheSize(), 0);
        settings->setIdleTimeout(-1);
        QCOMPARE(settings->idleTimeout(), 0);
    }
};

QTEST_GUILESS_MAIN(AppSettingsTest)
#include "tst_appsettings.moc"
