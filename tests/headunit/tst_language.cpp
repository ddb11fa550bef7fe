// SPDX-License-Identifier: MIT
#include "../HmiCore/catalogues.h"
#include "language.h"
#include "logcapture.h"
#include "market.h"
#include "moduletranslation.h"

#include <AL2HMIBridge/BridgeTester>
#include <HmiCore/HmiManager>
#include <HmiCore/HmiTranslationManager>
#include <HmiGuiFramework/AppSettings>

#include <QFont>
#include <QGuiApplication>
#include <QLocale>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QSignalSpy>

#include <memory>
#include <optional>

using AL2HMIBridge::BridgeTester;
using HmiCore::HmiManager;
using HmiCore::HmiTranslationManager;
using HmiGuiFramework::AppSettings;

namespace {

constexpr int english = 0;
constexpr int german = 2;
constexpr int french = 3;
constexpr int arabic = 7;
constexpr int europe = 0x114;
constexpr int gulf = 0x310;
constexpr int america = 0x348;

QString text(const char* utf8)
{
    return QString::fromUtf8(utf8);
}

} // namespace

/// Market and language as the head unit combines them, on a small product of their own.
class LanguageTest : public QObject
{
    Q_OBJECT
    Files files;
    std::optional<LogCapture> log;
    std::optional<BridgeTester> bridge;
    QQmlEngine engine;
    QObject owner;
    Market* market = nullptr;
    Language* language = nullptr;

    void lay(const char* file, const char* context, const char* source, const char* translation)
    {
        files.write(text("translations/") + text(file),
                    compileCatalogue(text(context), {{text(source), text(translation)}}));
    }

    static void set(int languageId) { BridgeTester::setState("GlobalSource", {{"systemLanguage", languageId}}); }
    static void setCountry(int country) { BridgeTester::setState("GlobalSource", {{"destinationCountry", country}}); }
    static QString current() { return HmiTranslationManager::instance()->currentLanguageId(); }
    static QString ofProduct() { return QCoreApplication::translate("Product", "Home"); }
    static QString ofModule() { return QCoreApplication::translate("Module", "Radio"); }

private Q_SLOTS:
    void initTestCase()
    {
        files.write(text("markets/config.json"),
                    "[{\"id\":\"114\",\"propertyFile\":\"e.json\",\"isFallback\":true},"
                    "{\"id\":\"310\",\"propertyFile\":\"m.json\"},{\"id\":\"348\",\"propertyFile\":\"a.json\"}]");
        files.write(text("markets/e.json"), "{\"languageBundle\":\"E\",\"region\":1,\"temperatureUnit\":\"celsius\"}");
        files.write(text("markets/m.json"), "{\"languageBundle\":\"M\",\"region\":2}");
        files.write(
            text("markets/a.json"),
            "{\"languageBundle\":\"A\",\"region\":1,\"temperatureUnit\":\"fahrenheit\",\"twelveHourClock\":true}");
        files.write(
            text("regions/config.json"),
            "[{\"id\":\"1\",\"propertyFile\":\"r.json\",\"isFallback\":true},{\"id\":\"2\",\"propertyFile\":\"s.json\"}]");
        files.write(text("regions/r.json"), "{\"audioSources\":[1,3]}");
        files.write(text("regions/s.json"), "{}");
        files.write(text("valuemappings.json"), "[]");
        files.write(
            text("languageBundles/config.json"),
            "[{\"bundleId\":\"E\",\"default\":\"en_US\",\"fallbackBundle\":true,\"locales\":[\"en_US\",\"de_DE\",\"fr_FR\"]},"
            "{\"bundleId\":\"M\",\"locales\":[\"ar_SA\",\"en_US\"]},{\"bundleId\":\"A\",\"locales\":[\"en_US\"]}]");
        files.write(
            text("languageBundles/properties.json"),
            "[{\"bundleId\":\"*\",\"locale\":\"*\",\"properties\":{\"fonts\":[\"Inter\"],\"rightToLeft\":false,\"dateFormat\":\"d\",\"keyboard\":\"Latin\"}},"
            "{\"bundleId\":\"M\",\"locale\":\"ar_SA\",\"properties\":{\"fonts\":[\"Noto Sans Arabic\",\"Inter\"],\"rightToLeft\":true,\"dateFormat\":\"dd\",\"keyboard\":\"Arabic\"}}]");
        lay("app/app_en_US.qm", "Product", "Home", "Home");
        lay("app/app_de_DE.qm", "Product", "Home", "Start");
        lay("app/app_fr_FR.qm", "Product", "Home", "Accueil");
        lay("app/app_ar_SA.qm", "Product", "Home", "الرئيسية");
        lay("radio_en.qm", "Module", "Radio", "Radio");
        lay("radio_de.qm", "Module", "Radio", "Rundfunk");
        lay("radio_ar.qm", "Module", "Radio", "الراديو");
        lay("radio_fr.qm", "Module", "Radio", "Radio FR");
        AppSettings::mainFolderPath = files.path() + QLatin1Char('/');

        log.emplace();
        bridge.emplace();
        market = new Market(&owner);
        language = new Language(market, &engine, &owner);
        language->start();
        registerModuleTranslation(text("radio"), &owner);
        QVERIFY(log->unexpected().isEmpty());
    }
    void init()
    {
        log.emplace();
        setCountry(europe);
        set(english);
        BridgeTester::takeCalls();
    }
    void cleanup() { log.reset(); }
    void cleanupTestCase()
    {
        log.emplace();
        bridge.reset();
        log->take(text("kest.hmicore"), QtWarningMsg);
        log.reset();
    }

    void productAndModulesFollowTheVehicle()
    {
        QCOMPARE(current(), text("en_US"));
        QSignalSpy retranslated(HmiManager::instance(), &HmiManager::hmiRetranslated);
        QSignalSpy changed(language, &Language::changed);
        set(german);
        QCOMPARE(current(), text("de_DE"));
        QCOMPARE(ofProduct(), text("Start"));
        QCOMPARE(ofModule(), text("Rundfunk"));
        QCOMPARE(retranslated.size(), 1);
        QCOMPARE(changed.size(), 1);
        QCOMPARE(QLocale().language(), QLocale::German);
    }

    void choosingAsksTheVehicle()
    {
        language->choose(german);
        QCOMPARE(BridgeTester::takeCalls(), {text("GlobalSource.setSystemLanguage(2)")});
        QCOMPARE(current(), text("en_US")); // until the vehicle says so
    }

    void whatQmlShowsFollows()
    {
        QQmlComponent component(&engine);
        component.setData("import QtQml 2.15\nQtObject { property string home: qsTranslate('Product', 'Home') }",
                          QUrl());
        const std::unique_ptr<QObject> object(component.create());
        QVERIFY2(object, qPrintable(component.errorString()));
        QCOMPARE(object->property("home").toString(), text("Home"));
        set(german);
        QCOMPARE(object->property("home").toString(), text("Start"));
    }

    void arabicGoesFromRightToLeftInItsOwnFonts()
    {
        setCountry(gulf);
        set(arabic);
        QCOMPARE(current(), text("ar_SA"));
        QVERIFY(AppSettings::instance()->rightToLeft());
        QCOMPARE(QGuiApplication::font().families().constFirst(), text("Noto Sans Arabic"));
        QCOMPARE(language->keyboard(), text("Arabic"));
        QCOMPARE(language->dateFormat(), text("dd"));
        set(english);
        QVERIFY(!AppSettings::instance()->rightToLeft());
        QCOMPARE(QGuiApplication::font().families().constFirst(), text("Inter"));
    }

    void aLanguageThatIsNotOfferedIsReplacedByTheDefault()
    {
        set(arabic);
        QCOMPARE(current(), text("en_US"));
        QCOMPARE(BridgeTester::takeCalls(), QStringList()); // the vehicle keeps its wish
        setCountry(gulf);
        QCOMPARE(current(), text("ar_SA"));
        setCountry(america);
        QCOMPARE(current(), text("en_US"));
    }

    void aMissingOrDamagedCatalogueKeepsTheLanguage_data()
    {
        QTest::addColumn<QString>("file");
        QTest::addColumn<QByteArray>("content");
        QTest::newRow("product, missing") << text("app/app_fr_FR.qm") << QByteArray();
        QTest::newRow("product, damaged") << text("app/app_fr_FR.qm") << QByteArray("damaged");
        QTest::newRow("module, missing") << text("radio_fr.qm") << QByteArray();
        QTest::newRow("module, damaged") << text("radio_fr.qm") << QByteArray("damaged");
    }
    void aMissingOrDamagedCatalogueKeepsTheLanguage()
    {
        QFETCH(QString, file);
        QFETCH(QByteArray, content);
        set(german);
        const QString path = text("translations/") + file;
        QFile original(files.path(path));
        QVERIFY(original.open(QIODevice::ReadOnly));
        const QByteArray before = original.readAll();
        original.close();
        files.remove(path);
        if (!content.isEmpty())
            files.write(path, content);

        QSignalSpy refused(language, &Language::refused);
        BridgeTester::takeCalls();
        set(french);
        QCOMPARE(current(), text("de_DE"));
        QCOMPARE(ofProduct(), text("Start"));
        QCOMPARE(ofModule(), text("Rundfunk")); // complete: modules as well
        QCOMPARE(refused.size(), 1);
        QCOMPARE(refused.constFirst().constFirst().toString(), text("Français"));
        QCOMPARE(BridgeTester::takeCalls(), {text("GlobalSource.setSystemLanguage(2)")});
        QVERIFY(log->take(text("kest.hmicore"), QtWarningMsg).contains(text("Restoring old system locale.")));
        log->take(text("default"), QtWarningMsg);

        files.write(path, before);
        set(german);
        set(french);
        QCOMPARE(current(), text("fr_FR"));
        QCOMPARE(ofModule(), text("Radio FR"));
    }

    void unitsAndClocksAreThoseOfTheMarket()
    {
        QVERIFY(market->temperature(18.5).startsWith(text("19 ")));
        QCOMPARE(market->clock(text("16:45")), text("16:45"));
        QCOMPARE(market->clock(text("soon")), text("soon"));
        QSignalSpy changed(market, &Market::changed);
        setCountry(america);
        QCOMPARE(changed.size(), 1);
        QVERIFY(market->temperature(18.5).startsWith(text("65 ")));
        QCOMPARE(market->clock(text("16:45")), text("4:45 PM"));
    }

    void digitsAreTheSameInAllLanguages()
    {
        setCountry(gulf);
        set(arabic);
        QCOMPARE(market->clock(text("16:45")), text("16:45"));
        QVERIFY(market->temperature(18.5).contains(text("19")));
    }

    void sourcesAreThoseOfTheRegion()
    {
        QVERIFY(market->offersSource(1));
        QVERIFY(market->offersSource(3));
        QVERIFY(!market->offersSource(2));
        setCountry(gulf); // its region lists none
        QVERIFY(market->offersSource(2));
        setCountry(99); // unknown: the fallback's
        QCOMPARE(market->languageBundle(), text("E"));
    }
};

QTEST_MAIN(LanguageTest)
#include "tst_language.moc"
