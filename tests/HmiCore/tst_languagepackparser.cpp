// SPDX-License-Identifier: MIT
#include "jsonfiles.h"
#include "logcapture.h"

#include <HmiCore/LanguagePackParser>

#include <optional>

using namespace HmiCore;
using Bundle = HmiLanguagePackCollection::LanguageBundle;

namespace {

const QString core = QStringLiteral("kest.hmicore");

QString text(const char* utf8)
{
    return QString::fromUtf8(utf8);
}

} // namespace

class LanguagePackParserTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::optional<Files> files;

    QMap<QString, Bundle> parse(const QByteArray& document)
    {
        files->write(text("config.json"), document);
        return LanguagePackParser().parse(text("config.json"), files->path());
    }

private Q_SLOTS:
    void init()
    {
        log.emplace();
        files.emplace();
    }
    void cleanup() { log.reset(); }

    void aNewBundleHasNoPolicy()
    {
        const Bundle bundle;
        QCOMPARE(bundle.orderingPolicy, HmiLanguagePackCollection::InvalidOrder);
        QVERIFY(!bundle.isFallback);
    }

    void readsBundles()
    {
        const auto bundles = parse(
            "[{\"bundleId\":\"Europe\",\"orderingPolicy\":\"NameOrder\",\"default\":\"en_GB\",\"fallbackBundle\":true,"
            "\"locales\":[\"en_GB\",\"de_DE\",\"fr_FR\"]},"
            "{\"bundleId\":\"NorthAmerica\",\"orderingPolicy\":\"DefinitionOrder\",\"locales\":[\"en_US\",\"es_MX\"]}]");
        QCOMPARE(bundles.keys(), QStringList({text("Europe"), text("NorthAmerica")}));
        const Bundle europe = bundles.value(text("Europe"));
        QCOMPARE(europe.locales, QStringList({text("en_GB"), text("de_DE"), text("fr_FR")}));
        QCOMPARE(europe.defaultLocale, text("en_GB"));
        QCOMPARE(europe.orderingPolicy, HmiLanguagePackCollection::NameOrder);
        QVERIFY(europe.isFallback);
        const Bundle america = bundles.value(text("NorthAmerica"));
        QCOMPARE(america.defaultLocale, text("en_US"));
        QCOMPARE(america.orderingPolicy, HmiLanguagePackCollection::DefinitionOrder);
        QVERIFY(!america.isFallback);
    }

    void policies_data()
    {
        QTest::addColumn<QByteArray>("member");
        QTest::addColumn<int>("policy");
        QTest::newRow("none") << QByteArray() << 1;
        QTest::newRow("name") << QByteArray(",\"orderingPolicy\":\"nameorder\"") << 1;
        QTest::newRow("definition") << QByteArray(",\"orderingPolicy\":\"DEFINITIONORDER\"") << 2;
        QTest::newRow("other") << QByteArray(",\"orderingPolicy\":\"Alphabetic\"") << 0;
        QTest::newRow("number") << QByteArray(",\"orderingPolicy\":1") << 0;
        QTest::newRow("blank") << QByteArray(",\"orderingPolicy\":\" NameOrder\"") << 0;
    }
    void policies()
    {
        QFETCH(QByteArray, member);
        const auto bundles = parse("[{\"bundleId\":\"a\",\"locales\":[]" + member + "}]");
        QTEST(int(bundles.value(text("a")).orderingPolicy), "policy");
    }

    void onlyTheFirstThatSaysSoIsTheFallback()
    {
        const auto two =
            parse("[{\"bundleId\":\"a\",\"locales\":[]},{\"bundleId\":\"b\",\"locales\":[],\"fallbackBundle\":true},"
                  "{\"bundleId\":\"c\",\"locales\":[],\"fallbackBundle\":true}]");
        QVERIFY(!two.value(text("a")).isFallback);
        QVERIFY(two.value(text("b")).isFallback);
        QVERIFY(!two.value(text("c")).isFallback);

        for (const char* const first : {"false", "1", "\"true\"", "null"}) {
            const auto bundles = parse(QByteArray("[{\"bundleId\":\"a\",\"locales\":[],\"fallbackBundle\":") + first
                                       + "},{\"bundleId\":\"b\",\"locales\":[],\"fallbackBundle\":true}]");
            QVERIFY(!bundles.value(text("a")).isFallback);
            QVERIFY(!bundles.value(text("b")).isFallback);
        }
        // One that is dropped has spoken, one without an id has not.
        QVERIFY(
            !parse(
                 "[{\"bundleId\":\"a\",\"fallbackBundle\":true},{\"bundleId\":\"b\",\"locales\":[],\"fallbackBundle\":true}]")
                 .value(text("b"))
                 .isFallback);
        QVERIFY(
            parse(
                "[{\"fallbackBundle\":true,\"locales\":[]},{\"bundleId\":\"b\",\"locales\":[],\"fallbackBundle\":true}]")
                .value(text("b"))
                .isFallback);
    }

    void incompleteElementsAreSkipped()
    {
        const auto bundles =
            parse("[{\"locales\":[\"de_DE\"]},{\"bundleId\":\"a\"},{\"bundleId\":\"b\",\"locales\":[]},7]");
        QCOMPARE(bundles.keys(), {text("b")});
        QCOMPARE(bundles.value(text("b")).defaultLocale, QString());
    }

    void theLastOfTwoReplacesTheOther()
    {
        const auto bundles = parse("[{\"bundleId\":\"a\",\"default\":\"x\",\"locales\":[\"de_DE\"]},"
                                   "{\"bundleId\":\"a\",\"locales\":[\"fr_FR\",7,null,\"it_IT\"]}]");
        QCOMPARE(bundles.value(text("a")).locales, QStringList({text("fr_FR"), QString(), QString(), text("it_IT")}));
        QCOMPARE(bundles.value(text("a")).defaultLocale, text("fr_FR"));
    }

    void theDefaultNeedNotBeInTheBundle()
    {
        QCOMPARE(
            parse("[{\"bundleId\":\"a\",\"default\":\"xx\",\"locales\":[\"de_DE\"]}]").value(text("a")).defaultLocale,
            text("xx"));
        QCOMPARE(parse("[{\"bundleId\":\"a\",\"default\":7,\"locales\":[\"de_DE\"]}]").value(text("a")).defaultLocale,
                 text("de_DE"));
    }

    void badFiles_data() { addBadDocuments(); }
    void badFiles()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, special);
        QFETCH(int, outcome);
        layDown(*files, text("config.json"), content, special);
        QVERIFY(LanguagePackParser().parse(text("config.json"), files->path()).isEmpty());
        const char* const messages[] = {
            "Invalid language bundle config file path:", "Could not read language bundle config file:",
            "Invalid json in language bundle config file:"};
        QStringList expected;
        if (outcome < 3)
            expected.append(text("QMap<QString, HmiCore::HmiLanguagePackCollection::LanguageBundle> "
                                 "HmiCore::LanguagePackParser::parse(const QString&, const QString&) ")
                            + text(messages[outcome]) + text(" \"config.json\""));
        QCOMPARE(log->take(core, QtWarningMsg), expected);
    }
};

QTEST_GUILESS_MAIN(LanguagePackParserTest)
#include "tst_languagepackparser.moc"
