// SPDX-License-Identifier: MIT
#include "catalogues.h"
#include "logcapture.h"

#include <HmiCore/HmiModuleTranslation>
#include <HmiCore/HmiTranslation>
#include <HmiCore/HmiTranslationManager>
#include <HmiCore/HmiTranslator>

#include <QLocale>
#include <QQmlEngine>
#include <QRegularExpression>
#include <QSignalSpy>

#include <memory>
#include <optional>

using namespace HmiCore;

namespace {

const QString core = QStringLiteral("kest.hmicore");

QString text(const char* utf8)
{
    return QString::fromUtf8(utf8);
}

QByteArray catalogue(const char* source, const QString& translation)
{
    return compileCatalogue(text("C"), {{text(source), translation}});
}

QString shown(const char* source)
{
    return QCoreApplication::translate("C", source);
}

/// Module translations stay registered for ever; each test function of the manager has its own process's one.
struct SwitchableModule : HmiModuleTranslation
{
    SwitchableModule()
        : HmiModuleTranslation(text("switchable"), QString(), QCoreApplication::instance())
    {
    }
    bool loadTranslation(const QString& languageId) const override
    {
        asked.append(languageId);
        return !refused.contains(languageId);
    }
    mutable QStringList asked;
    QStringList refused;
};

} // namespace

class HmiTranslationManagerTest : public QObject
{
    Q_OBJECT
    std::optional<LogCapture> log;
    std::optional<Files> files;
    HmiTranslationManager* manager = nullptr;

    void lay(const char* file, const char* source, const QString& translation)
    {
        files->write(text(file), catalogue(source, translation));
    }

    static int children(const HmiTranslation& translation)
    {
        return int(translation.findChildren<HmiTranslator*>().size());
    }

private Q_SLOTS:
    void initTestCase()
    {
        manager = HmiTranslationManager::instance();
        QVERIFY(!catalogue("x", text("y")).isEmpty());
    }
    void init()
    {
        log.emplace();
        files.emplace();
    }
    void cleanup()
    {
        manager->activateHmiTranslation(nullptr);
        log.reset();
    }

    void lettersWithTheByteOfACarriageReturnStay()
    {
        const QString word = QString::fromUtf8("več അ"); // U+010D and U+0D05
        lay("a.qm", "Radio", word);
        HmiTranslator translator(nullptr);
        QVERIFY(translator.load(files->path(text("a.qm"))));
        QCOMPARE(translator.translate("C", "Radio"), word);
        lay("b.qm", "Radio", word + QLatin1Char('\r'));
        QVERIFY(translator.load(files->path(text("b.qm"))));
        QCOMPARE(translator.translate("C", "Radio"), word);
    }

    void aTranslatorAlwaysAnswers()
    {
        lay("a.qm", "Radio", text("Rund\r\nfunk\r"));
        HmiTranslator translator(nullptr);
        QVERIFY(translator.load(files->path(text("a.qm"))));
        QCOMPARE(translator.translate("C", "Radio"), text("Rund\nfunk"));
        QCOMPARE(translator.translate("C", "Ph\xf6ne\r"), QString::fromLatin1("Ph\xf6ne"));
        QCOMPARE(translator.translate("Other", "Radio"), text("Radio"));
        QCOMPARE(translator.translate("C", "\r\r"), QString());
        QCOMPARE(translator.translate("C", ""), QString());
        QCOMPARE(translator.translate("C", "%n file(s)", nullptr, 2), text("%n Dateien"));
    }

    void translatorsBeforeAreNotAsked()
    {
        lay("a.qm", "Radio", text("Rundfunk"));
        QTranslator before;
        QVERIFY(before.load(files->path(text("a.qm"))));
        QCoreApplication::installTranslator(&before);
        QCOMPARE(shown("Radio"), text("Rundfunk"));
        HmiTranslator empty(nullptr);
        QCoreApplication::installTranslator(&empty);
        QCOMPARE(shown("Radio"), text("Radio"));
    }

    void allCataloguesWithTheLanguageInTheirNameAreLoaded()
    {
        lay("app_de_DE.qm", "Radio", text("Rundfunk"));
        lay("app_de_DE_extra.qm", "Phone", text("Telefon"));
        lay("app_de_AT.qm", "Cream", text("Obers"));
        lay("app_fr_FR.qm", "Radio", text("Radio FR"));
        HmiTranslation translation(files->path(), nullptr);
        QVERIFY(translation.activateTranslation(text("de_DE")));
        QCOMPARE(children(translation), 2);
        QVERIFY(translation.activateTranslation(text("de")));
        QCOMPARE(children(translation), 3);
        QVERIFY(translation.activateTranslation(text("fr_FR")));
        QCOMPARE(shown("Radio"), text("Radio FR"));
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QCOMPARE(children(translation), 1); // the first one, used again
    }

    void translatorsAreUsedAgainInPlace()
    {
        lay("app_de_DE.qm", "Radio", text("Rundfunk"));
        lay("app_fr_FR.qm", "Radio", text("Radio FR"));
        HmiTranslation translation(files->path(), nullptr);
        QVERIFY(translation.activateTranslation(text("de_DE")));
        const HmiTranslator* const first = translation.findChild<HmiTranslator*>();
        HmiTranslator later(nullptr); // answers everything
        QCoreApplication::installTranslator(&later);
        QVERIFY(translation.activateTranslation(text("fr_FR")));
        QCOMPARE(translation.findChild<HmiTranslator*>(), first);
        QCOMPARE(shown("Radio"), text("Radio")); // still behind the later one
    }

    void removedTranslatorsLiveUntilTheEventLoop()
    {
        lay("app_de_DE.qm", "Radio", text("Rundfunk"));
        HmiTranslation translation(files->path(), nullptr);
        QVERIFY(translation.activateTranslation(text("de_DE")));
        const QPointer<HmiTranslator> translator = translation.findChild<HmiTranslator*>();
        translation.deactivate();
        QVERIFY(translator);
        QCOMPARE(shown("Radio"), text("Radio"));
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QVERIFY(!translator);
    }

    void anEmptyLanguageChangesNothing()
    {
        lay("app_de_DE.qm", "Radio", text("Rundfunk"));
        HmiTranslation translation(files->path(), nullptr);
        QVERIFY(translation.activateTranslation(text("de_DE")));
        QVERIFY(!translation.activateTranslation(QString()));
        QCOMPARE(shown("Radio"), text("Rundfunk"));
    }

    void aDamagedCatalogueIsLeftOut()
    {
        lay("app_de_DE.qm", "Radio", text("Rundfunk"));
        files->write(text("broken_de_DE.qm"), "no catalogue");
        HmiTranslation translation(files->path(), nullptr);
        QVERIFY(translation.activateTranslation(text("de_DE")));
        QCOMPARE(
            log->take(text("default"), QtWarningMsg),
            {QStringLiteral("Failed to load translation file:\n \"%1\"").arg(files->path(text("broken_de_DE.qm")))});
        QCOMPARE(shown("Radio"), text("Rundfunk"));
        files->remove(text("app_de_DE.qm"));
        QVERIFY(!translation.activateTranslation(text("de_DE")));
        QCOMPARE(shown("Radio"), text("Radio"));
        QCOMPARE(log->take(text("default"), QtWarningMsg).size(), 1);
    }

    void cataloguesAreNamedUpToTheFirstDot()
    {
        lay("app_de_DE.qm", "Radio", text("Rundfunk"));
        lay("app_de_DE.old.qm", "Radio", text("Altfunk"));
        HmiTranslation translation(files->path(), nullptr);
        QVERIFY(translation.activateTranslation(text("old")));
        QCOMPARE(shown("Radio"), text("Rundfunk"));
    }

    void pipesAndFoldersAreNoCatalogues()
    {
        files->makePipe(text("pipe_de_DE.qm"));
        QVERIFY(QDir().mkpath(files->path(text("folder_de_DE.qm"))));
        HmiTranslation translation(files->path(), nullptr);
        QVERIFY(!translation.activateTranslation(text("de_DE")));
    }

    void aModulesTranslatorIsMadeOnce()
    {
        lay("radio_de.qm", "Radio", text("Rundfunk"));
        HmiModuleTranslation module(files->path(text("radio")), text("_"), nullptr);
        QCOMPARE(module.moduleId(), files->path(text("radio")));
        QCOMPARE(module.translationPath(), text("_"));
        QVERIFY(!module.loadTranslation(text("de_DE"))); // no translator yet
        QTranslator* const translator = module.translator();
        QCOMPARE(module.translator(), translator);
        QCOMPARE(translator->parent(), &module);
        QVERIFY(module.activateTranslation(text("de_DE")));
        QCOMPARE(translator->translate("C", "Radio"), text("Rundfunk"));
        QVERIFY(!module.activateTranslation(text("fr_FR")));
        QVERIFY(translator->isEmpty());
    }

    void aModuleFindsVariantsOfTheLanguage()
    {
        HmiModuleTranslation module(files->path(text("radio")), text("_"), nullptr);
        QVERIFY(module.translator());
        lay("radio_de_DE.qm", "Radio", text("Hörfunk"));
        QVERIFY(module.activateTranslation(text("de_DE")));
        QCOMPARE(module.translator()->translate("C", "Radio"), text("Hörfunk"));
        QVERIFY(!module.activateTranslation(text("de_AT")));
        lay("radio_de.qm", "Radio", text("Rundfunk"));
        QVERIFY(module.activateTranslation(text("de_AT")));
        QCOMPARE(module.translator()->translate("C", "Radio"), text("Rundfunk"));
    }

    void aModulesDamagedCatalogueIsRefused()
    {
        files->write(text("radio_de_DE.qm"), catalogue("Radio", text("Rundfunk")).replace("\x69", "\x42"));
        HmiModuleTranslation module(files->path(text("radio")), text("_"), nullptr);
        QVERIFY(module.translator());
        QVERIFY(!module.activateTranslation(text("de_DE")));
        QVERIFY(module.translator()->isEmpty());
    }

    void thereIsOneManager()
    {
        QCOMPARE(HmiTranslationManager::instance(), manager);
        QCOMPARE(manager->parent(), QCoreApplication::instance());
        QQmlEngine engine;
        QCOMPARE(HmiTranslationManager::translationManagerProvider(&engine, &engine), manager);
        QCOMPARE(QQmlEngine::objectOwnership(manager), QQmlEngine::CppOwnership);
        QCOMPARE(manager->currentLanguageId(), QString());
    }

    void theLanguageChangesEverywhere()
    {
        lay("app_de_DE.qm", "Radio", text("Rundfunk"));
        lay("app_fr_FR.qm", "Radio", text("Radio FR"));
        HmiTranslation translation(files->path(), nullptr);
        manager->activateHmiTranslation(&translation);
        QCOMPARE(children(translation), 0); // no language yet
        QSignalSpy changes(manager, &HmiTranslationManager::currentLanguageIdChanged);
        QVERIFY(manager->setProperty("currentLanguageId", text("de_DE")));
        QCOMPARE(changes.size(), 1);
        QCOMPARE(changes.constFirst().constFirst().toString(), text("de_DE"));
        QCOMPARE(manager->currentLanguageId(), text("de_DE"));
        QCOMPARE(QLocale(), QLocale(text("de_DE")));
        QCOMPARE(shown("Radio"), text("Rundfunk"));
        manager->setCurrentLanguageId(text("de_DE"));
        QCOMPARE(changes.size(), 1);

        // Another core translation begins in the present language, and the old one is put away.
        Files others;
        others.write(text("x_de_DE.qm"), catalogue("Radio", text("Hörfunk")));
        HmiTranslation other(others.path(), nullptr);
        manager->activateHmiTranslation(&other);
        QCOMPARE(shown("Radio"), text("Hörfunk"));
        manager->activateHmiTranslation(nullptr);
        QCOMPARE(shown("Radio"), text("Radio"));
        manager->setCurrentLanguageId(text("fr_FR")); // with nothing to translate, it cannot fail
        QCOMPARE(changes.size(), 2);
    }

    void aLanguageWithoutCatalogueChangesNothing()
    {
        lay("app_de_DE.qm", "Radio", text("Rundfunk"));
        HmiTranslation translation(files->path(), nullptr);
        manager->activateHmiTranslation(&translation);
        manager->setCurrentLanguageId(text("de_DE"));
        QSignalSpy changes(manager, &HmiTranslationManager::currentLanguageIdChanged);
        manager->setCurrentLanguageId(text("it_IT"));
        QCOMPARE(log->take(core, QtWarningMsg),
                 QStringList({text("Failed to activate a translation: \nHmiTranslation \nLanguageId: \"it_IT\""),
                              text("Restoring old system locale.")}));
        QCOMPARE(changes.size(), 0);
        QCOMPARE(manager->currentLanguageId(), text("de_DE"));
        QCOMPARE(QLocale(), QLocale(text("de_DE")));
        QCOMPARE(shown("Radio"), text("Rundfunk"));
    }

    void changesFromInsideAChange()
    {
        lay("app_de_DE.qm", "Radio", text("Rundfunk"));
        lay("app_fr_FR.qm", "Radio", text("Radio FR"));
        lay("app_es_ES.qm", "Radio", text("Radio ES"));
        HmiTranslation translation(files->path(), nullptr);
        manager->activateHmiTranslation(&translation);
        manager->setCurrentLanguageId(text("es_ES"));
        QStringList told;
        QObject context;
        connect(manager, &HmiTranslationManager::currentLanguageIdChanged, &context, [&](const QString& language) {
            told.append(language + QLatin1Char(' ') + shown("Radio"));
            manager->setCurrentLanguageId(text("fr_FR"));
        });
        manager->setCurrentLanguageId(text("de_DE"));
        QCOMPARE(told, QStringList({text("de_DE Rundfunk"), text("fr_FR Radio FR")}));
        QCOMPARE(manager->currentLanguageId(), text("fr_FR"));
        QCOMPARE(shown("Radio"), text("Radio FR"));
        QCOMPARE(QLocale(), QLocale(text("fr_FR")));
    }

    void tenThousandChangesLeaveNothingBehind()
    {
        lay("app_de_DE.qm", "Radio", text("Rundfunk"));
        lay("more_de_DE.qm", "Phone", text("Telefon"));
        lay("app_fr_FR.qm", "Radio", text("Radio FR"));
        HmiTranslation translation(files->path(), nullptr);
        manager->activateHmiTranslation(&translation);
        for (int i = 0; i < 10000; ++i) {
            manager->setCurrentLanguageId(i % 2 == 0 ? text("de_DE") : text("fr_FR"));
            if (i % 100 == 0)
                QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        }
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QCOMPARE(children(translation), 1);
        QCOMPARE(translation.children().size(), 1);
        QCOMPARE(shown("Radio"), text("Radio FR"));
    }

    /// The last two: what is registered here stays.
    void zModulesAreLoadedWithTheNextChange()
    {
        lay("radio_de_DE.qm", "Radio", text("Modulfunk"));
        lay("radio_fr_FR.qm", "Radio", text("Module FR"));
        manager->setCurrentLanguageId(text("de_DE"));
        manager->registerModuleTranslation(nullptr);
        auto* const module =
            new HmiModuleTranslation(files->path(text("radio")), text("_"), QCoreApplication::instance());
        manager->registerModuleTranslation(module);
        QCOMPARE(shown("Radio"), text("Radio"));
        manager->setCurrentLanguageId(text("fr_FR"));
        QCOMPARE(shown("Radio"), text("Module FR"));
        manager->setCurrentLanguageId(text("de_DE"));
        QCOMPARE(shown("Radio"), text("Modulfunk"));

        // One that has its translator before is loaded at once.
        auto* const early =
            new HmiModuleTranslation(files->path(text("radio")), text("_"), QCoreApplication::instance());
        QVERIFY(early->translator()->isEmpty());
        manager->registerModuleTranslation(early);
        QVERIFY(!early->translator()->isEmpty());

        // A module without a catalogue keeps everybody in the language before.
        auto* const switchable = new SwitchableModule;
        manager->registerModuleTranslation(switchable);
        QCOMPARE(switchable->asked, {text("de_DE")});
        switchable->refused = QStringList{text("fr_FR")};
        manager->setCurrentLanguageId(text("fr_FR"));
        QCOMPARE(
            log->take(core, QtWarningMsg),
            QStringList({text("Failed to activate a translation: \nModule: \"switchable\" \nLanguageId: \"fr_FR\""),
                         text("Restoring old system locale.")}));
        QCOMPARE(switchable->asked, QStringList({text("de_DE"), text("fr_FR"), text("de_DE")}));
        QCOMPARE(shown("Radio"), text("Modulfunk"));
        QCOMPARE(manager->currentLanguageId(), text("de_DE"));

        // All parts are tried, whichever fails.
        switchable->asked.clear();
        files->write(text("radio_fr_FR.qm"), "damaged");
        switchable->refused.clear();
        QVERIFY(!manager->retranslate(text("fr_FR")));
        QCOMPARE(switchable->asked, {text("fr_FR")});
        QCOMPARE(log->take(core, QtWarningMsg).size(), 2); // two modules share the damaged file
    }
};

QTEST_GUILESS_MAIN(HmiTranslationManagerTest)
#include "tst_hmitranslationmanager.moc"
