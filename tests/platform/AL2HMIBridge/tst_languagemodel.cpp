// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <AL2HMIBridge/BridgeTester>
#include <AL2HMIBridge/LanguageModel>

#include <QAbstractItemModelTester>
#include <QTest>

#include <memory>

using namespace AL2HMIBridge;

class LanguageModelTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;

    static GlobalSource::SystemLanguage language(int id) { return static_cast<GlobalSource::SystemLanguage>(id); }

private Q_SLOTS:
    void init() { m_log = std::make_unique<LogCapture>(); }
    void cleanup() { m_log.reset(); }

    void isAProperModel()
    {
        const QAbstractItemModelTester tester(LanguageModel::instance(),
                                              QAbstractItemModelTester::FailureReportingMode::QtTest);
        QVERIFY(LanguageModel::instance()->rowCount() > 0);
        QCOMPARE(LanguageModel::instance()->rowCount(LanguageModel::instance()->index(0)), 0);
    }

    void languagesHaveLocaleAndNativeName_data()
    {
        QTest::addColumn<QString>("locale");
        QTest::addColumn<QString>("name");
        const struct
        {
            const char* locale;
            const char* name;
        } rows[] = {{"en_US", "English (US)"},
                    {"en_GB", "English (UK)"},
                    {"de_DE", "Deutsch"},
                    {"fr_FR", "Français"},
                    {"fr_CA", "Français (Canada)"},
                    {"es_ES", "Español"},
                    {"es_MX", "Español (México)"},
                    {"ar_SA", "العربية"},
                    {"zh_CN", "简体中文"},
                    {"zh_TW", "繁體中文"},
                    {"it_IT", "Italiano"},
                    {"pt_PT", "Português"},
                    {"nl_NL", "Nederlands"},
                    {"pl_PL", "Polski"},
                    {"ru_RU", "Русский"},
                    {"tr_TR", "Türkçe"},
                    {"sv_SE", "Svenska"},
                    {"cs_CZ", "Čeština"},
                    {"ja_JP", "日本語"},
                    {"ko_KR", "한국어"}};
        for (const auto& row : rows)
            QTest::newRow(row.locale) << QString::fromLatin1(row.locale) << QString::fromUtf8(row.name);
    }

    void languagesHaveLocaleAndNativeName()
    {
        QFETCH(QString, locale);
        const LanguageModel* const model = LanguageModel::instance();
        const int id = model->idForLocale(locale);
        QVERIFY(id >= 0);
        QCOMPARE(model->localeFromId(language(id)), locale);
        const QModelIndexList rows = model->match(model->index(0), 1, locale, 2, Qt::MatchExactly);
        QCOMPARE(rows.size(), 1);
        QTEST(rows.constFirst().data(2).toString(), "name");
        QTEST(rows.constFirst().data(Qt::DisplayRole).toString(), "name");
    }

    void unknownLanguagesHaveNoLocaleAndNoNumber()
    {
        QCOMPARE(LanguageModel::instance()->localeFromId(language(9999)), QString());
        QCOMPARE(LanguageModel::instance()->localeFromId(language(-1)), QString());
        QCOMPARE(LanguageModel::instance()->idForLocale(QString()), -1);
        QCOMPARE(LanguageModel::instance()->idForLocale(QStringLiteral("DE_de")), -1);
    }

    void supportFollowsTheVehicle()
    {
        const BridgeTester tester;
        const LanguageModel* const model = LanguageModel::instance();
        QVERIFY(model->languageSupported(GlobalSource::LanguageGerman));
        QVERIFY(BridgeTester::setState("GlobalSource", {{"supportedLanguages", QVariantList{0, 3}}}));
        QVERIFY(!model->languageSupported(GlobalSource::LanguageGerman));
        QVERIFY(model->languageSupported(GlobalSource::LanguageFrench));
        QVERIFY(!model->languageSupported(language(9999)));
    }
};

QTEST_GUILESS_MAIN(LanguageModelTest)
#include "tst_languagemodel.moc"
