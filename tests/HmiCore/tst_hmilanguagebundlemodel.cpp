// SPDX-License-Identifier: MIT
#include "jsonfiles.h"
#include "logcapture.h"

#include <AL2HMIBridge/BridgeTester>
#include <AL2HMIBridge/LanguageModel>
#include <HmiCore/HmiLanguageBundleModel>
#include <HmiCore/HmiLanguagePackCollection>
#include <HmiCore/HmiMarketPropertyStore>
#include <HmiGuiFramework/AppSettings>

#include <QAbstractItemModelTester>
#include <QMetaProperty>
#include <QSignalSpy>

#include <optional>

using namespace HmiCore;
using AL2HMIBridge::BridgeTester;
using AL2HMIBridge::LanguageModel;

namespace {

constexpr int german = 2;
constexpr int french = 3;
constexpr int arabic = 7;
constexpr int britishEnglish = 1;
constexpr int americanEnglish = 0;

QString text(const char* utf8)
{
    return QString::fromUtf8(utf8);
}

} // namespace

/// The language packs and the model on top of them, on the platform's own languages.
class HmiLanguageBundleModelTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::optional<BridgeTester> bridge;
    Files files;

    static QStringList locales(const QAbstractItemModel& model)
    {
        QStringList all;
        for (int row = 0; row < model.rowCount(); ++row)
            all.append(model.index(row, 0).data(1).toString());
        return all;
    }

private Q_SLOTS:
    void initTestCase()
    {
        files.write(
            text("languageBundles/config.json"),
            "[{\"bundleId\":\"b\",\"locales\":[\"de_DE\",\"fr_FR\",\"en_GB\",\"de_DE\"],\"default\":\"en_GB\","
            "\"orderingPolicy\":\"DefinitionOrder\"},"
            "{\"bundleId\":\"A\",\"locales\":[\"fr_FR\",\"en_GB\",\"ar_SA\",\"de_DE\"],\"fallbackBundle\":true},"
            "{\"bundleId\":\"a\",\"locales\":[\"fr_FR\",\"en_GB\",\"de_DE\"],\"orderingPolicy\":\"odd\"},"
            "{\"bundleId\":\"none\",\"locales\":[]}]");
        HmiGuiFramework::AppSettings::mainFolderPath = files.path() + QLatin1Char('/');
        files.write(text("markets.json"),
                    "[{\"id\":\"1A\",\"propertyFile\":\"p.json\"},{\"id\":\"1B\",\"propertyFile\":\"q.json\"}]");
        files.write(text("p.json"), "{\"languageBundle\":\"b\"}");
        files.write(text("q.json"), "{}");
        HmiMarketPropertyStore::instance()->loadConfiguration(files.path(), text("markets.json"));
    }
    void init()
    {
        log.emplace();
        bridge.emplace();
    }
    void cleanup()
    {
        bridge.reset();
        log.reset();
    }

    void packsAnswer()
    {
        const HmiLanguagePackCollection* const packs = HmiLanguagePackCollection::instance();
        QCOMPARE(packs, HmiLanguagePackCollection::instance());
        QCOMPARE(packs->parent(), QCoreApplication::instance());
        QCOMPARE(packs->bundles(), QStringList({text("A"), text("a"), text("b"), text("none")}));
        QCOMPARE(packs->fallbackBundleId(), text("A"));
        QVERIFY(packs->inBundle(text("b"), text("de_DE")));
        QVERIFY(!packs->inBundle(text("b"), text("de_de")));
        QVERIFY(!packs->inBundle(text("c"), text("de_DE")));
        QCOMPARE(packs->policyForBundle(text("b")), HmiLanguagePackCollection::DefinitionOrder);
        QCOMPARE(packs->policyForBundle(text("c")), HmiLanguagePackCollection::InvalidOrder);
        QCOMPARE(packs->indexInBundle(text("b"), text("de_DE")), 0);
        QCOMPARE(packs->indexInBundle(text("b"), text("en_GB")), 2);
        QCOMPARE(packs->indexInBundle(text("b"), text("it_IT")), -1);
        QCOMPARE(packs->indexInBundle(text("c"), text("de_DE")), -1);
        QCOMPARE(packs->defaultForBundle(text("b")), text("en_GB"));
        QCOMPARE(packs->defaultForBundle(text("c")), QString());
        QCOMPARE(packs->bundleLocales(text("c")), QStringList());
        QCOMPARE(packs->bundleLanguageIds(text("b")), QList<int>({german, french, britishEnglish, german}));
        QCOMPARE(packs->bundleLanguageIds(text("c")), QList<int>());
    }

    void theMarketDecidesWhatIsSupported()
    {
        const HmiLanguagePackCollection* const packs = HmiLanguagePackCollection::instance();
        BridgeTester::setState("GlobalSource", {{"destinationCountry", 0x1A}});
        QVERIFY(packs->supported(german));
        QVERIFY(!packs->supported(arabic));
        QVERIFY(!packs->supported(1000));
        QVERIFY(!packs->supported(-1));
        BridgeTester::setState("GlobalSource", {{"supportedLanguages", QVariantList{french}}});
        QVERIFY(packs->supported(french));
        QVERIFY(!packs->supported(german)); // not in this vehicle
        BridgeTester::setState("GlobalSource", {{"destinationCountry", 0x1B}});
        QVERIFY(!packs->supported(french)); // "Unknown property" is no bundle
        BridgeTester::setState("GlobalSource", {{"destinationCountry", 7}});
        QVERIFY(!packs->supported(french));
    }

    void policyTexts()
    {
        QCOMPARE(HmiLanguagePackCollection::orderPolicyFromString(text("NAMEorder")),
                 HmiLanguagePackCollection::NameOrder);
        QCOMPARE(HmiLanguagePackCollection::orderPolicyFromString(QString()), HmiLanguagePackCollection::InvalidOrder);
    }

    void aNewModelIsEmpty()
    {
        HmiLanguageBundleModel model(nullptr);
        const QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
        QCOMPARE(model.bundleId(), QString());
        QCOMPARE(model.count(), 0);
        QCOMPARE(model.candidateLanguage(), -1);
        QCOMPARE(model.supportedLanguage(), -1);
        QCOMPARE(model.sourceModel(), LanguageModel::instance());
        QCOMPARE(model.sortRole(), 2);
        QCOMPARE(model.sortColumn(), 0);
    }

    void theMetaObjectIsThatOfTheContract()
    {
        const QMetaObject& meta = HmiLanguageBundleModel::staticMetaObject;
        const auto notifier = [&meta](const char* name) {
            return meta.property(meta.indexOfProperty(name)).notifySignal().methodSignature();
        };
        QCOMPARE(notifier("bundleId"), QByteArray("bundleIdChanged(QString)"));
        QCOMPARE(notifier("count"), QByteArray("countChanged(int)"));
        QCOMPARE(notifier("candidateLanguage"), QByteArray("candidateLanguageChanged(int)"));
        QCOMPARE(notifier("supportedLanguage"), QByteArray("supportedLanguageChanged(int)"));
        QVERIFY(!meta.property(meta.indexOfProperty("supportedLanguage")).isWritable());
        QVERIFY(meta.indexOfMethod("mapped(int)") >= 0);
    }

    void definitionOrder()
    {
        HmiLanguageBundleModel model(nullptr);
        model.setBundleId(text("b"));
        QCOMPARE(locales(model), QStringList({text("de_DE"), text("fr_FR"), text("en_GB")}));
        QCOMPARE(model.count(), 3);
        QCOMPARE(model.mapped(0), german);
        QCOMPARE(model.mapped(2), britishEnglish);
        QCOMPARE(model.mapped(3), -1);
        QCOMPARE(model.mapped(-1), -1);
    }

    void nameOrder()
    {
        HmiLanguageBundleModel model(nullptr);
        model.setBundleId(text("A"));
        QCOMPARE(locales(model), QStringList({text("de_DE"), text("en_GB"), text("fr_FR"), text("ar_SA")}));
    }

    void anUnknownPolicySortsByTheStandard()
    {
        HmiLanguageBundleModel model(nullptr);
        model.setBundleId(text("a"));
        QCOMPARE(locales(model), QStringList({text("de_DE"), text("en_GB"), text("fr_FR")}));
    }

    void anUnknownBundleIsTheFallback()
    {
        HmiLanguageBundleModel model(nullptr);
        QSignalSpy ids(&model, &HmiLanguageBundleModel::bundleIdChanged);
        QSignalSpy counts(&model, &HmiLanguageBundleModel::countChanged);
        model.setBundleId(text("c"));
        QCOMPARE(model.bundleId(), text("A"));
        QCOMPARE(ids.size(), 1);
        QCOMPARE(ids.constFirst().constFirst().toString(), text("A"));
        QCOMPARE(counts.constFirst().constFirst().toInt(), 4);
        model.setBundleId(text("A"));
        model.setBundleId(text("d"));
        QCOMPARE(ids.size(), 1);
        QCOMPARE(counts.size(), 1);
    }

    void theOldRowsAreThereWhenTheBundleChanges()
    {
        HmiLanguageBundleModel model(nullptr);
        model.setBundleId(text("b"));
        int atIdChange = -1;
        connect(&model, &HmiLanguageBundleModel::bundleIdChanged, &model, [&] { atIdChange = model.count(); });
        model.setBundleId(text("none"));
        QCOMPARE(atIdChange, 3); // told before the rows follow
        QCOMPARE(model.count(), 0);
    }

    void candidates()
    {
        HmiLanguageBundleModel model(nullptr);
        model.setBundleId(text("b"));
        QStringList told;
        connect(&model, &HmiLanguageBundleModel::candidateLanguageChanged, &model, [&](int language) {
            told.append(QStringLiteral("candidate %1 %2").arg(language).arg(model.supportedLanguage()));
        });
        connect(&model, &HmiLanguageBundleModel::supportedLanguageChanged, &model,
                [&](int language) { told.append(QStringLiteral("supported %1").arg(language)); });
        model.setCandidateLanguage(german);
        QCOMPARE(told, QStringList({text("candidate 2 -1"), text("supported 2")}));
        told.clear();
        model.setCandidateLanguage(german);
        QCOMPARE(told, QStringList());
        model.setCandidateLanguage(arabic);
        QCOMPARE(told, QStringList({text("candidate 7 2"), text("supported 1")})); // en_GB is the default
        told.clear();
        model.setCandidateLanguage(americanEnglish);
        QCOMPARE(told, QStringList({text("candidate 0 1"), text("supported 1")})); // told although it did not change
    }

    void anotherBundleLeavesTheSupportedLanguage()
    {
        HmiLanguageBundleModel model(nullptr);
        model.setBundleId(text("A"));
        model.setCandidateLanguage(arabic);
        QCOMPARE(model.supportedLanguage(), arabic);
        QSignalSpy supported(&model, &HmiLanguageBundleModel::supportedLanguageChanged);
        model.setBundleId(text("b"));
        QCOMPARE(model.supportedLanguage(), arabic);
        QCOMPARE(supported.size(), 0);
        QCOMPARE(model.bundleSupportedLanguage(arabic), britishEnglish);
    }

    void withoutABundleThePlatformAnswersForNoLocale()
    {
        HmiLanguageBundleModel model(nullptr);
        model.setBundleId(text("none"));
        QCOMPARE(model.bundleSupportedLanguage(german), LanguageModel::instance()->idForLocale(QString()));
    }
};

QTEST_GUILESS_MAIN(HmiLanguageBundleModelTest)
#include "tst_hmilanguagebundlemodel.moc"
