// SPDX-License-Identifier: MIT
#include "guifixture.h"

#include <HmiGuiFramework/HmiImageProvider>
#include <HmiGuiFramework/UiThemeManager>

#include <QColor>
#include <QDir>
#include <QFile>
#include <QTemporaryDir>

using HmiGuiFramework::UiThemeManager;

class UiThemeManagerTest : public QObject
{
    Q_OBJECT

    static QString text(const char* name) { return QString::fromLatin1(name); }

    struct Themes
    {
        LogCapture log;
        QQmlEngine engine;
        QTemporaryDir folder;
        UiThemeManager manager{&engine, nullptr, nullptr, nullptr};

        QString write(const QByteArray& content)
        {
            QFile file(folder.filePath(QStringLiteral("theme.json")));
            if (file.open(QIODevice::WriteOnly))
                file.write(content);
            return file.fileName();
        }

        bool loadGood()
        {
            return manager.loadTheme(write(
                R"({"palettes": {"day": {"surface": "white"}, "night": {"surface": "black"}}, "defaultPalette": "day",)"
                R"("values": {"gap": 16, "font": "Inter"}})"));
        }

        QColor surface() { return manager.colors()->value(QStringLiteral("surface")).value<QColor>(); }
    };

private Q_SLOTS:
    void aThemeGivesColoursAndValues()
    {
        Themes themes;
        QSignalSpy themeChange(&themes.manager, &UiThemeManager::themeChange);
        QVERIFY(themes.loadGood());
        QCOMPARE(themeChange.count(), 1);
        QCOMPARE(themes.manager.palettes(), QStringList({text("day"), text("night")}));
        QCOMPARE(themes.manager.palette(), text("day"));
        QCOMPARE(themes.surface(), QColor(Qt::white));
        QCOMPARE(themes.manager.values()->value(text("gap")).toInt(), 16);
        QCOMPARE(themes.manager.values()->value(text("font")).toString(), text("Inter"));
    }

    void aChangeOfPaletteIsAnnouncedBeforeAndAfterTheColours()
    {
        Themes themes;
        QVERIFY(themes.loadGood());
        QColor before;
        QColor after;
        connect(&themes.manager, &UiThemeManager::paletteChange, this, [&](const QString& id) {
            QCOMPARE(id, text("night"));
            before = themes.surface();
        });
        connect(&themes.manager, &UiThemeManager::paletteChangeComplete, this, [&](const QString& id) {
            QCOMPARE(id, text("night"));
            after = themes.surface();
        });
        themes.manager.setPalette(text("night"));
        QCOMPARE(before, QColor(Qt::white));
        QCOMPARE(after, QColor(Qt::black));
    }

    void theSamePaletteIsNotAnnounced()
    {
        Themes themes;
        QVERIFY(themes.loadGood());
        QSignalSpy changed(&themes.manager, &UiThemeManager::paletteChange);
        themes.manager.setPalette(text("day"));
        QCOMPARE(changed.count(), 0);
    }

    void anUnknownPaletteIsRefused()
    {
        Themes themes;
        QVERIFY(themes.loadGood());
        themes.manager.setPalette(text("dusk"));
        QVERIFY(themes.log.takeOne(QtWarningMsg, text("palette dusk refused: the theme does not have it")));
        QCOMPARE(themes.manager.palette(), text("day"));
    }

    void aNewThemeKeepsThePaletteItHasToo()
    {
        Themes themes;
        QVERIFY(themes.loadGood());
        themes.manager.setPalette(text("night"));
        QVERIFY(themes.manager.loadTheme(
            themes.write(R"({"palettes": {"day": {"surface": "red"}, "night": {"surface": "blue"}}})")));
        QCOMPARE(themes.manager.palette(), text("night"));
        QCOMPARE(themes.surface(), QColor(Qt::blue));
        QVERIFY(themes.manager.loadTheme(themes.write(R"({"palettes": {"dusk": {"surface": "lime"}}})")));
        QCOMPARE(themes.manager.palette(), text("dusk"));
    }

    void iconsAreDrawnInTheColoursOfThePalette()
    {
        Themes themes;
        QDir(themes.folder.path()).mkdir(text("icons"));
        QFile icon(themes.folder.filePath(text("icons/dot.svg")));
        QVERIFY(icon.open(QIODevice::WriteOnly));
        icon.write(
            "<svg xmlns='http://www.w3.org/2000/svg' width='8' height='8'><rect width='8' height='8' fill='currentColor'/></svg>");
        icon.close();
        HmiGuiFramework::AppSettings::mainFolderPath = themes.folder.path() + QLatin1Char('/');
        QVERIFY(themes.loadGood());
        HmiGuiFramework::HmiImageProvider provider;
        const auto color = [&] {
            return provider.requestImage(text("dot?color=surface"), nullptr, QSize()).pixelColor(4, 4);
        };
        connect(&themes.manager, &UiThemeManager::paletteChange, this, [&] { provider.clearCache(); });
        QCOMPARE(color(), QColor(Qt::white));
        themes.manager.setPalette(text("night"));
        QCOMPARE(color(), QColor(Qt::black));
        HmiGuiFramework::AppSettings::mainFolderPath.clear();
    }

    void aFaultyThemeIsRefusedWithTheFieldAndChangesNothing_data()
    {
        QTest::addColumn<QByteArray>("content");
        QTest::addColumn<QString>("error");
        QTest::newRow("not JSON") << QByteArray("{\n\n") << text("line 3: ");
        QTest::newRow("no palettes") << QByteArray("{}")
                                     << text("palettes: must be an object with at least one palette");
        QTest::newRow("palettes empty") << QByteArray(R"({"palettes": {}})")
                                        << text("palettes: must be an object with at least one palette");
        QTest::newRow("palette empty")
            << QByteArray(R"({"palettes": {"day": {}}})")
            << text("palettes.day: must give a colour to the same roles as the other palettes");
        QTest::newRow("not a colour") << QByteArray(R"({"palettes": {"day": {"surface": "whitish"}}})")
                                      << text("palettes.day.surface: is not a colour");
        QTest::newRow("roles differ")
            << QByteArray(R"({"palettes": {"day": {"a": "white"}, "night": {"b": "black"}}})")
            << text("palettes.night: must give a colour to the same roles as the other palettes");
        QTest::newRow("default palette") << QByteArray(
            R"({"palettes": {"day": {"a": "white"}}, "defaultPalette": "x"})")
                                         << text("defaultPalette: there is no palette \"x\"");
        QTest::newRow("value") << QByteArray(R"({"palettes": {"day": {"a": "white"}}, "values": {"gap": []}})")
                               << text("values.gap: must be a number or a string");
    }

    void aFaultyThemeIsRefusedWithTheFieldAndChangesNothing()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, error);
        Themes themes;
        QVERIFY(themes.loadGood());
        const QString path = themes.write(content);
        QVERIFY(!themes.manager.loadTheme(path));
        const QStringList warnings = themes.log.take(text("hmi.gui"), QtWarningMsg);
        QCOMPARE(warnings.size(), 1);
        QVERIFY2(warnings.at(0).startsWith(text("theme %1 refused: %2").arg(path, error)), qPrintable(warnings.at(0)));
        QCOMPARE(themes.surface(), QColor(Qt::white));
    }
};

QTEST_MAIN(UiThemeManagerTest)
#include "tst_uithememanager.moc"
