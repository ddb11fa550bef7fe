// SPDX-License-Identifier: MIT
#include "jsonfiles.h"
#include "logcapture.h"

#include <HmiCore/ConfigurationProcessor>
#include <HmiCore/HmiMarketPropertyStore>
#include <HmiCore/HmiPropertyStore>
#include <HmiCore/HmiRegionPropertyStore>

#include <QQmlEngine>

#include <optional>

using namespace HmiCore;

namespace {

const QString core = QStringLiteral("kest.hmicore");
const QString config = QStringLiteral("config.json");

QString text(const char* utf8)
{
    return QString::fromUtf8(utf8);
}

} // namespace

class HmiPropertyStoreTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::optional<Files> files;
    std::optional<HmiPropertyStore> store;

    void configure(const QByteArray& document)
    {
        files->write(config, document);
        store->loadConfiguration(files->path(), config);
    }

    QStringList debugLines() { return log->take(core, QtDebugMsg); }

    /// The three configurations of which 1A is the fallback and -1 fills the gaps.
    void configureMarkets()
    {
        files->write(text("default.json"), "{\"unit\":\"km\",\"colour\":\"blue\"}");
        files->write(text("a.json"),
                     "{\"languageBundle\":\"Europe\",\"showTrafficInfo\":true,\"maxPresets\":12,\"unit\":\"mile\"}");
        files->write(text("b.json"),
                     "{\"languageBundle\":\"China\",\"nothing\":null,\"list\":[1,\"x\"],\"map\":{\"a\":1}}");
        configure("[{\"id\":\"-1\",\"propertyFile\":\"default.json\"},"
                  "{\"id\":\"1A\",\"propertyFile\":\"a.json\",\"isFallback\":true},"
                  "{\"id\":\"2b\",\"propertyFile\":\"b.json\"}]");
    }

private Q_SLOTS:
    void init()
    {
        log.emplace(text("kest.hmicore.debug=true"));
        files.emplace();
        store.emplace(nullptr);
    }
    void cleanup()
    {
        store.reset();
        log.reset();
    }

    void anUnconfiguredStoreKnowsNothing()
    {
        QCOMPARE(store->getProperty(26, text("unit")), QVariant());
        QCOMPARE(debugLines(), QStringList({text("Invalid id: \"1a\""), text("No fallback provided.")}));
        QCOMPARE(store->getProperty(-26, text("unit")), QVariant());
        QCOMPARE(debugLines().constFirst(), text("Invalid id: \"-1a\""));
    }

    void valuesKeepTheirTypes()
    {
        configureMarkets();
        QCOMPARE(debugLines(), {text("HMI properties: QMap((-1, \"default.json\")(26, \"a.json\")(43, \"b.json\"))")});
        QCOMPARE(store->getProperty(26, text("languageBundle")), QVariant(text("Europe")));
        QCOMPARE(store->getProperty(26, text("showTrafficInfo")), QVariant(true));
        const QVariant number = store->getProperty(26, text("maxPresets"));
        QCOMPARE(number, QVariant(12.0));
        QCOMPARE(store->getProperty(43, text("list")), QVariant(QVariantList{1.0, text("x")}));
        QCOMPARE(store->getProperty(43, text("map")), QVariant(QVariantMap{{text("a"), 1.0}}));
        const QVariant null = store->getProperty(43, text("nothing"));
        QVERIFY(null.isValid() && null.isNull());
        QCOMPARE(debugLines(), QStringList());
    }

    void gapsAreFilledByTheDefaults()
    {
        configureMarkets();
        QCOMPARE(store->getProperty(26, text("unit")), QVariant(text("mile")));
        QCOMPARE(store->getProperty(43, text("unit")), QVariant(text("km")));
        QCOMPARE(store->getProperty(26, text("colour")), QVariant(text("blue")));
    }

    void whatNobodyHasIsNamedUnknown()
    {
        configureMarkets();
        debugLines();
        QCOMPARE(store->getProperty(26, text("weight")), QVariant(text("Unknown property")));
        QCOMPARE(debugLines(), {text("Invalid property: \"weight\"")});
        QCOMPARE(store->getProperty(-1, text("weight")), QVariant(text("Unknown property")));
    }

    void anUnknownIdIsTheFallback()
    {
        configureMarkets();
        debugLines();
        QCOMPARE(store->getProperty(7, text("languageBundle")), QVariant(text("Europe")));
        QCOMPARE(debugLines(), {text("Invalid id: \"7\"")});
        QCOMPARE(store->getProperty(7, text("colour")), QVariant(text("blue")));
        QCOMPARE(store->getProperty(7, text("weight")), QVariant(text("Unknown property")));
    }

    void idsAreHexadecimalTexts_data()
    {
        QTest::addColumn<QByteArray>("id");
        QTest::addColumn<int>("number");
        QTest::addColumn<bool>("known");
        QTest::newRow("upper case") << QByteArray("\"1A\"") << 26 << true;
        QTest::newRow("lower case") << QByteArray("\"1a\"") << 26 << true;
        QTest::newRow("prefix") << QByteArray("\"0x1A\"") << 26 << true;
        QTest::newRow("a number") << QByteArray("26") << 26 << false;
        QTest::newRow("digits are not decimal") << QByteArray("\"26\"") << 26 << false;
        QTest::newRow("digits are hexadecimal") << QByteArray("\"26\"") << 38 << true;
        QTest::newRow("no digit") << QByteArray("\"xyz\"") << 0 << false;
        QTest::newRow("empty") << QByteArray("\"\"") << 0 << false;
        QTest::newRow("too large") << QByteArray("\"123456789\"") << 0 << false;
        QTest::newRow("with NUL") << QByteArray("\"1A\\u0000\"") << 26 << false;
        QTest::newRow("null") << QByteArray("null") << 0 << false;
    }

    void idsAreHexadecimalTexts()
    {
        QFETCH(QByteArray, id);
        QFETCH(int, number);
        files->write(text("p.json"), "{\"a\":1}");
        configure("[{\"id\":" + id + ",\"propertyFile\":\"p.json\"}]");
        QTEST(store->getProperty(number, text("a")).isValid(), "known");
    }

    void elementsWithoutAProperIdAreSkippedWhole()
    {
        files->write(text("p.json"), "{\"a\":1}");
        configure("[{\"id\":\"5\",\"propertyFile\":\"p.json\"},"
                  "{\"id\":\"zz\",\"propertyFile\":\"q.json\",\"isFallback\":true},{\"isFallback\":true},7]");
        QCOMPARE(store->getProperty(9, text("a")), QVariant());
        QCOMPARE(store->getProperty(5, text("a")), QVariant(1.0));
    }

    void theLastOfTwoWins()
    {
        files->write(text("p.json"), "{\"a\":1}");
        files->write(text("q.json"), "{\"a\":2}");
        configure(
            "[{\"id\":\"5\",\"propertyFile\":\"p.json\",\"isFallback\":true},{\"id\":\"5\",\"propertyFile\":\"q.json\"},"
            "{\"id\":\"6\",\"propertyFile\":\"p.json\",\"isFallback\":true},"
            "{\"id\":\"7\",\"propertyFile\":\"q.json\",\"isFallback\":false},"
            "{\"id\":\"8\",\"propertyFile\":\"q.json\",\"isFallback\":\"true\"}]");
        QCOMPARE(store->getProperty(5, text("a")), QVariant(2.0));
        QCOMPARE(store->getProperty(99, text("a")), QVariant(1.0)); // of 6
    }

    void aFallbackWithoutAFileIsSilent()
    {
        configure("[{\"id\":\"5\",\"isFallback\":true}]");
        debugLines();
        QCOMPARE(store->getProperty(9, text("a")), QVariant());
        QCOMPARE(debugLines(), QStringList({text("Invalid id: \"9\""), text("Invalid id: \"5\"")}));
        QCOMPARE(store->getProperty(5, text("a")), QVariant());
        QCOMPARE(debugLines(), {text("Invalid id: \"5\"")});
    }

    void minusOneAsFallbackIsNone()
    {
        files->write(text("p.json"), "{\"a\":1}");
        configure("[{\"id\":\"-1\",\"propertyFile\":\"p.json\",\"isFallback\":true}]");
        debugLines();
        QCOMPARE(store->getProperty(9, text("a")), QVariant());
        QCOMPARE(debugLines(), QStringList({text("Invalid id: \"9\""), text("No fallback provided.")}));
    }

    void filesAreReadOnce()
    {
        configureMarkets();
        QCOMPARE(store->getProperty(26, text("unit")), QVariant(text("mile")));
        files->write(text("a.json"), "{\"unit\":\"ell\"}");
        QCOMPARE(store->getProperty(26, text("unit")), QVariant(text("mile")));
    }

    void filesThatFailAreTriedAgain()
    {
        configure("[{\"id\":\"5\",\"propertyFile\":\"late.json\"}]");
        for (int i = 0; i < 2; ++i) {
            QCOMPARE(store->getProperty(5, text("a")), QVariant());
            QCOMPARE(log->take(core, QtWarningMsg),
                     {QStringLiteral("Property file does not exist: \"%1\"").arg(files->path(text("late.json")))});
        }
        files->write(text("late.json"), "{\"a\":1}");
        QCOMPARE(store->getProperty(5, text("a")), QVariant(1.0));
    }

    void anotherConfigurationKeepsWhatWasRead()
    {
        configureMarkets();
        store->getProperty(26, text("unit"));
        files->write(text("c.json"), "{\"unit\":\"verst\"}");
        configure("[{\"id\":\"1a\",\"propertyFile\":\"c.json\"},{\"id\":\"2b\",\"propertyFile\":\"c.json\"}]");
        QCOMPARE(store->getProperty(26, text("unit")), QVariant(text("mile")));
        QCOMPARE(store->getProperty(43, text("unit")), QVariant(text("verst")));
        QCOMPARE(store->getProperty(9, text("unit")), QVariant()); // the fallback is gone
    }

    void badDocuments_data() { addBadDocuments(); }
    void badDocuments()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, special);
        QFETCH(int, outcome);
        layDown(*files, config, content, special);
        store->loadConfiguration(files->path(), config);
        const QStringList warnings = log->take(core, QtWarningMsg);
        const char* const starts[] = {"Property config file does not exist: \"", "Can't read property config file: \"",
                                      "Property config file parse error: \""};
        QCOMPARE(warnings.size(), outcome < 3 ? 1 : 0);
        if (outcome < 3)
            QVERIFY2(warnings.constFirst().startsWith(text(starts[outcome])), qPrintable(warnings.constFirst()));
        if (outcome < 2)
            QVERIFY(warnings.constFirst().endsWith(files->path(config) + QLatin1Char('"')));
        QCOMPARE(store->getProperty(1, text("a")), QVariant());
    }

    void badPropertyFiles_data() { addBadDocuments(); }
    void badPropertyFiles()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, special);
        QFETCH(int, outcome);
        files->write(text("default.json"), "{\"a\":\"by default\"}");
        layDown(*files, text("p.json"), content, special);
        configure("[{\"id\":\"5\",\"propertyFile\":\"p.json\"},{\"id\":\"-1\",\"propertyFile\":\"default.json\"}]");
        const QVariant value = store->getProperty(5, text("a"));
        const QStringList warnings = log->take(core, QtWarningMsg);
        const char* const starts[] = {"Property file does not exist: \"", "Can't read property file: \"",
                                      "Property file parse error: \""};
        QCOMPARE(warnings.size(), outcome < 3 ? 1 : 0);
        if (outcome < 3)
            QVERIFY2(warnings.constFirst().startsWith(text(starts[outcome])), qPrintable(warnings.constFirst()));
        // What is no object is cached as one without properties.
        QCOMPARE(value, outcome < 3 ? QVariant() : QVariant(text("by default")));
    }

    void oddButReadable()
    {
        files->write(text("p.json"), "{\"twice\":1,\"twice\":2,\"nul\":\"a\\u0000b\",\"\":\"no name\"}");
        configure("[{\"id\":\"5\",\"propertyFile\":\"p.json\"}]");
        QCOMPARE(store->getProperty(5, text("twice")), QVariant(2.0));
        QCOMPARE(store->getProperty(5, text("nul")).toString().size(), 3);
        QCOMPARE(store->getProperty(5, QString()), QVariant(text("no name")));
    }

    void warningsNameTheirModule()
    {
        store->loadConfiguration(files->path(), text("none.json"));
        const auto records = log->records();
        QVERIFY(records.constFirst().file.endsWith(QLatin1String("hmimarketpropertystore.cpp")));
        log->take(core, QtWarningMsg);
    }

    void readsTheTopOfADocument()
    {
        files->write(config, "[1,2,3]");
        QCOMPARE(ConfigurationProcessor::readConfigurationDocument(files->path(config)).size(), 3);
        QMap<int, QMap<QString, QVariant>> properties{{5, {{text("old"), 1}}}};
        files->write(text("p.json"), "{\"new\":1}");
        ConfigurationProcessor::parse(files->path(text("p.json")), 5, properties);
        QCOMPARE(properties.value(5).keys(), {text("new")});
        ConfigurationProcessor::parse(files->path(text("none.json")), 5, properties);
        QCOMPARE(properties.value(5).keys(), {text("new")});
        log->take(core, QtWarningMsg);
    }

    void thereIsOneOfEachKind()
    {
        QCOMPARE(HmiRegionPropertyStore::instance(), HmiRegionPropertyStore::instance());
        QVERIFY(static_cast<QObject*>(HmiRegionPropertyStore::instance()) != HmiMarketPropertyStore::instance());
        QQmlEngine engine;
        for (QObject* const object : {HmiRegionPropertyStore::regionPropertyStoreProvider(&engine, &engine),
                                      HmiMarketPropertyStore::marketPropertyStoreProvider(&engine, &engine)}) {
            QCOMPARE(object->parent(), QCoreApplication::instance());
            QCOMPARE(QQmlEngine::objectOwnership(object), QQmlEngine::CppOwnership);
        }
        QCOMPARE(HmiMarketPropertyStore::marketPropertyStoreProvider(&engine, &engine),
                 HmiMarketPropertyStore::instance());
    }
};

QTEST_GUILESS_MAIN(HmiPropertyStoreTest)
#include "tst_hmimarketpropertystore.moc"
