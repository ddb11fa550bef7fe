// SPDX-License-Identifier: MIT
#include "jsonfiles.h"
#include "logcapture.h"

#include <HmiCore/HmiLanguagePropertyStore>
#include <HmiCore/LanguagePropertyParser>
#include <HmiGuiFramework/AppSettings>

#include <QQmlEngine>

#include <optional>

using namespace HmiCore;

namespace {

const QString core = QStringLiteral("kest.hmicore");

QString text(const char* utf8)
{
    return QString::fromUtf8(utf8);
}

} // namespace

class HmiLanguagePropertyStoreTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    Files files;

    static QVariant property(const char* bundle, const char* locale, const char* name)
    {
        return HmiLanguagePropertyStore::instance()->getLanguageProperty(text(bundle), text(locale), text(name));
    }

private Q_SLOTS:
    void initTestCase()
    {
        files.write(
            text("languageBundles/properties.json"),
            "[{\"bundleId\":\"*\",\"locale\":\"*\",\"properties\":{\"font\":\"Sans\",\"rightToLeft\":false,\"lines\":3}},"
            "{\"bundleId\":\"MiddleEast\",\"locale\":\"*\",\"properties\":{\"font\":\"ArabicSans\",\"rightToLeft\":true}},"
            "{\"bundleId\":\"MiddleEast\",\"locale\":\"en_GB\",\"properties\":{\"font\":\"Serif\"}},"
            "{\"bundleId\":\"*\",\"locale\":\"ja_JP\",\"properties\":{\"font\":\"Kana\"}},"
            "{\"bundleId\":\"List\",\"locale\":\"*\",\"properties\":[1,2]}]");
        HmiGuiFramework::AppSettings::mainFolderPath = files.path() + QLatin1Char('/');
    }
    void init() { log.emplace(); }
    void cleanup() { log.reset(); }

    void thereIsOne()
    {
        QQmlEngine engine;
        QObject* const store = HmiLanguagePropertyStore::languagePropertyStoreProvider(&engine, &engine);
        QCOMPARE(store, HmiLanguagePropertyStore::instance());
        QCOMPARE(store->parent(), QCoreApplication::instance());
        QCOMPARE(QQmlEngine::objectOwnership(store), QQmlEngine::CppOwnership);
    }

    void theMostSpecificEntryIsTaken()
    {
        QCOMPARE(property("MiddleEast", "en_GB", "font"), QVariant(text("Serif")));
        QCOMPARE(property("MiddleEast", "ar_SA", "font"), QVariant(text("ArabicSans")));
        QCOMPARE(property("MiddleEast", "ar_SA", "rightToLeft"), QVariant(true));
        QCOMPARE(property("Europe", "de_DE", "font"), QVariant(text("Sans")));
        QCOMPARE(property("Europe", "*", "font"), QVariant(text("Sans")));
        QCOMPARE(property("MiddleEast", "*", "font"), QVariant(text("ArabicSans")));
    }

    void entriesDoNotCompleteEachOther()
    {
        QCOMPARE(property("MiddleEast", "en_GB", "rightToLeft"), QVariant());
        QCOMPARE(property("MiddleEast", "ar_SA", "lines"), QVariant());
        QCOMPARE(property("List", "de_DE", "font"), QVariant());
    }

    void aLocaleOfAnyBundleIsTakenForAnyBundleOnly()
    {
        QCOMPARE(property("Europe", "ja_JP", "font"), QVariant(text("Sans")));
        QCOMPARE(property("*", "ja_JP", "font"), QVariant(text("Kana")));
        QCOMPARE(property("*", "de_DE", "font"), QVariant(text("Sans")));
        QCOMPARE(property("*", "*", "lines"), QVariant(3.0));
    }

    void storesAreGivenWhole()
    {
        const auto* const store = HmiLanguagePropertyStore::instance();
        QCOMPARE(store->getStore({text("MiddleEast"), text("en_GB")}).keys(), {text("font")});
        QVERIFY(store->getStore({text("List"), text("x")}).isEmpty());
    }

    void incompleteElementsAreSkipped()
    {
        files.write(text("p.json"), "[{\"locale\":\"a\",\"properties\":{}},{\"bundleId\":\"a\",\"properties\":{}},"
                                    "{\"bundleId\":\"a\",\"locale\":\"a\"},7,"
                                    "{\"bundleId\":\"a\",\"locale\":\"b\",\"properties\":{\"x\":1,\"y\":1}},"
                                    "{\"bundleId\":\"a\",\"locale\":\"b\",\"properties\":{\"x\":2}}]");
        const auto stores = LanguagePropertyParser().parse(text("p.json"), files.path());
        QCOMPARE(stores.size(), 1);
        QCOMPARE(stores.value({text("a"), text("b")}), (QMap<QString, QVariant>{{text("x"), 2.0}}));
    }

    void withoutAnythingAllIsInvalid()
    {
        Files empty;
        const auto stores = LanguagePropertyParser().parse(text("none.json"), empty.path());
        QVERIFY(stores.isEmpty());
        QCOMPARE(log->take(core, QtWarningMsg).size(), 1);
    }

    void badFiles_data() { addBadDocuments(); }
    void badFiles()
    {
        QFETCH(QByteArray, content);
        QFETCH(QString, special);
        QFETCH(int, outcome);
        Files folder;
        layDown(folder, text("p.json"), content, special);
        QVERIFY(LanguagePropertyParser().parse(text("p.json"), folder.path()).isEmpty());
        const char* const messages[] = {
            "Invalid language properties file path:", "Could not read language properties file:",
            "Invalid json in language properties file:"};
        const QStringList warnings = log->take(core, QtWarningMsg);
        QCOMPARE(warnings.size(), outcome < 3 ? 1 : 0);
        if (outcome == 3)
            return;
        const QString expected = text("HmiCore::LanguagePropertyParser::parse(const QString&, const QString&) ")
                                 + text(messages[outcome]) + text(" \"p.json\"");
        QVERIFY2(warnings.constFirst().endsWith(expected), qPrintable(warnings.constFirst()));
#if QT_VERSION < QT_VERSION_CHECK(6, 0, 0)
        QCOMPARE(warnings.constFirst(), text("QHash<QPair<QString, QString>, QMap<QString, QVariant> > ") + expected);
#endif
    }
};

QTEST_GUILESS_MAIN(HmiLanguagePropertyStoreTest)
#include "tst_hmilanguagepropertystore.moc"
