// SPDX-License-Identifier: MIT
#include "cataloguefiles.h"
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include "moduleintents.h"

#include <AL2HMIBridge/LanguageModel>
#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiTranslationManager>
#include <HmiGuiFramework/StatusBarController>
#include <HmiGuiFramework/UiThemeManager>
#include <HmiStateMachine/StateMachine>

#include <QRegularExpression>

#include <memory>

using AL2HMIBridge::BridgeTester;

/// Every view and popup, in both sizes and all languages: nothing is cut off, nothing is too small to touch, and no text is
/// left in another language.
class ScreensTest : public QObject
{
    Q_OBJECT

    static constexpr int marketWithAllLanguages = 2;
    static constexpr const char* locales[] = {"en_US", "de_DE", "fr_FR", "es_MX", "ar_SA", "zh_CN", "zh_TW"};
    static constexpr double smallestTarget = 51; // reference pixels: 9 mm on the reference screen

    static void fillWithState()
    {
        const auto record = [](std::initializer_list<std::pair<QString, QVariant>> fields) {
            return QVariant(QVariantMap(fields));
        };
        QVariantList stations;
        QVariantList presets;
        QVariantList contacts;
        QVariantList tracks;
        for (int i = 1; i <= 12; ++i) {
            const QString name = QStringLiteral("Station %1").arg(i);
            const QString frequency = QString::number(88 + i) + QStringLiteral(".3");
            stations.append(record({{QStringLiteral("name"), name}, {QStringLiteral("frequency"), frequency}}));
            contacts.append(record({{QStringLiteral("name"), QStringLiteral("Person %1").arg(i)},
                                    {QStringLiteral("number"), QStringLiteral("+49 30 555%1").arg(i)}}));
            tracks.append(record({{QStringLiteral("title"), QStringLiteral("Title %1").arg(i)},
                                  {QStringLiteral("artist"), QStringLiteral("Artist %1").arg(i / 3)},
                                  {QStringLiteral("album"), QStringLiteral("Album %1").arg(i / 4)},
                                  {QStringLiteral("duration"), 60 * i}}));
            if (i <= 6)
                presets.append(record({{QStringLiteral("bank"), 1},
                                       {QStringLiteral("index"), i},
                                       {QStringLiteral("name"), name},
                                       {QStringLiteral("frequency"), frequency}}));
        }
        QVERIFY(BridgeTester::setState(
            "GlobalSource", {{"mainAudioSource", 1}, {"clockText", QStringLiteral("14:05")}, {"volume", 20}}));
        QVERIFY(BridgeTester::setState("FMTunerSource", {{"frequency", QStringLiteral("107.9")},
                                                         {"frequencyUnit", QStringLiteral("MHz")},
                                                         {"stationName", QStringLiteral("Station 12")},
                                                         {"stationList", stations},
                                                         {"presets", presets},
                                                         {"activePreset", 8},
                                                         {"activePresetBank", 1},
                                                         {"radioText", QStringLiteral("What the station has to say")},
                                                         {"hdAvailable", true},
                                                         {"hdSignalLossStatus", 1},
                                                         {"stereo", true},
                                                         {"signalStrength", 70},
                                                         {"trafficAnnouncementEnabled", true}}));
        QVERIFY(BridgeTester::setState("XMTunerSource", {{"channelNumber", 121},
                                                         {"stationName", QStringLiteral("A channel from above")},
                                                         {"category", QStringLiteral("Classical")},
                                                         {"artist", QStringLiteral("An orchestra of good name")},
                                                         {"title", QStringLiteral("Overture to an opera")},
                                                         {"presets", presets},
                                                         {"replayStatus", 1}}));
        QVERIFY(BridgeTester::setState("MediaAudioSource", {{"title", QStringLiteral("A song of some length")},
                                                            {"artist", QStringLiteral("A band of five people")},
                                                            {"album", QStringLiteral("An album")},
                                                            {"library", tracks},
                                                            {"trackIndex", 3},
                                                            {"position", 61},
                                                            {"duration", 3600},
                                                            {"playing", true}}));
        QVERIFY(BridgeTester::setState("CDSource", {{"cdStatus", 2},
                                                    {"track", 3},
                                                    {"trackCount", 12},
                                                    {"discTitle", QStringLiteral("A disc")},
                                                    {"title", QStringLiteral("Its third track")},
                                                    {"duration", 200}}));
        QVERIFY(BridgeTester::setState("PhoneSource", {{"deviceName", QStringLiteral("A phone")},
                                                       {"signalStrength", 3},
                                                       {"batteryLevel", 100},
                                                       {"callerName", QStringLiteral("Person 1")},
                                                       {"callerNumber", QStringLiteral("+49 30 5551")},
                                                       {"contacts", contacts}}));
    }

    static QStringList cutOffTexts()
    {
        QStringList found;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
            if (item->property("truncated").toBool() && !item->property("text").toString().isEmpty())
                found.append(Screen::pathOf(item) + QStringLiteral(": ") + item->property("text").toString());
        });
        return found;
    }

    static QStringList smallTargets()
    {
        const double scale = qMin(Screen::window()->width() / 1280.0, Screen::window()->height() / 720.0);
        QStringList found;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
            if (item->objectName() == QLatin1String("touchArea")
                && qMin(item->width(), item->height()) < smallestTarget * scale - 1)
                found.append(
                    QStringLiteral("%1: %2 x %3").arg(Screen::pathOf(item)).arg(item->width()).arg(item->height()));
        });
        return found;
    }

    /// Touchable items that lie partly outside of the window, unless they are in something that scrolls.
    static QStringList outside()
    {
        const QRectF window(QPointF(0, 0), QSizeF(Screen::window()->size()));
        QStringList found;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
            if (item->objectName() != QLatin1String("touchArea"))
                return;
            for (const QQuickItem* parent = item; parent; parent = parent->parentItem())
                if (parent->inherits("QQuickFlickable"))
                    return;
            if (!window.contains(item->mapRectToScene(QRectF(0, 0, item->width(), item->height()))))
                found.append(Screen::pathOf(item));
        });
        return found;
    }

    static const QQuickItem* buttonAround(const QQuickItem* item)
    {
        while (item && !item->property("pressedFill").isValid())
            item = item->parentItem();
        return item;
    }

    /// Texts of keys, tiles and rows that are higher or wider than those.
    static QStringList spilledTexts()
    {
        QStringList found;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
            const QQuickItem* const button = item->inherits("QQuickText") ? buttonAround(item) : nullptr;
            if (!button || item->property("text").toString().isEmpty())
                return;
            const QRectF text = item->mapRectToItem(button, QRectF(0, 0, item->width(), item->height()));
            if (!QRectF(-1, -1, button->width() + 2, button->height() + 2).contains(text))
                found.append(Screen::pathOf(item) + QStringLiteral(": ") + item->property("text").toString());
        });
        return found;
    }

    static void setLanguage(const QString& locale)
    {
        const int language = AL2HMIBridge::LanguageModel::instance()->idForLocale(locale);
        QVERIFY2(language >= 0, qPrintable(locale));
        QVERIFY(BridgeTester::setState("GlobalSource",
                                       {{"destinationCountry", marketWithAllLanguages}, {"systemLanguage", language}}));
        QTRY_COMPARE(HmiCore::HmiTranslationManager::instance()->currentLanguageId(), locale);
        QCOMPARE(HmiGuiFramework::AppSettings::instance()->rightToLeft(), locale.startsWith(QLatin1String("ar")));
    }

    /// Matches the source of every text that is another one in this language.
    static QRegularExpression englishOf(const QString& language)
    {
        QStringList sources;
        for (const auto& catalogue : CatalogueFiles::all())
            for (const auto& message : CatalogueFiles::messagesOf(catalogue, language))
                if (!message.forms.contains(message.source))
                    sources.append(
                        QRegularExpression::escape(message.source)
                            .replace(QRegularExpression(QStringLiteral("\\\\%L?[0-9n]")), QStringLiteral(".+")));
        return QRegularExpression(QStringLiteral("^(%1)$").arg(sources.join(QLatin1Char('|'))));
    }

    /// Texts on the screen, and names for who cannot see them, that are still those of the sources.
    static QStringList leftInEnglish(const QString& locale)
    {
        const bool isChinese = locale.startsWith(QLatin1String("zh"));
        const QRegularExpression english = englishOf(isChinese ? locale : locale.left(2));
        QStringList found;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
            for (const char* const property : {"text", "label"}) {
                const QString text = item->property(property).toString();
                if (english.match(text).hasMatch())
                    found.append(Screen::pathOf(item) + QStringLiteral(": ") + text);
            }
        });
        return found;
    }

    static void verifyScreen(const QString& locale)
    {
        QVERIFY2(cutOffTexts().isEmpty(), qPrintable(cutOffTexts().join(QLatin1Char('\n'))));
        QVERIFY2(spilledTexts().isEmpty(), qPrintable(spilledTexts().join(QLatin1Char('\n'))));
        QCOMPARE(smallTargets(), QStringList());
        QCOMPARE(outside(), QStringList());
        const QStringList english = locale.startsWith(QLatin1String("en")) ? QStringList() : leftInEnglish(locale);
        QVERIFY2(english.isEmpty(), qPrintable(english.join(QLatin1Char('\n'))));
    }

    static bool show(const QString& name)
    {
        auto* const views = Screen::views();
        if (views->guiDescriptor().popups.contains(name))
            return views->requestPopup(name);
        return views->requestView(name) && Screen::shows(qPrintable(name));
    }

    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_vehicle = std::make_unique<BridgeTester>();
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        fillWithState();
    }

    void cleanup()
    {
        m_vehicle.reset(); // a call that ends leads elsewhere
        Screen::views()->requestView(QStringLiteral("SYSTEM.Launcher"));
        m_log.reset();
    }

    void everythingFits_data()
    {
        QTest::addColumn<QString>("view");
        QTest::addColumn<QSize>("size");
        QTest::addColumn<QString>("locale");
        QTRY_VERIFY(!Screen::views()->guiDescriptor().views.isEmpty());
        const auto descriptor = Screen::views()->guiDescriptor();
        QStringList names = descriptor.views.keys() + descriptor.popups.keys();
        names.sort();
        QVERIFY(names.size() >= 12);
        for (const QString& name : std::as_const(names))
            for (const QSize& size : {QSize(1280, 720), QSize(800, 480)})
                for (const char* const locale : locales)
                    QTest::addRow("%s %dx%d %s", qPrintable(name), size.width(), size.height(), locale)
                        << name << size << QString::fromLatin1(locale);
    }

    void everythingFits()
    {
        QFETCH(QString, view);
        QFETCH(QSize, size);
        QFETCH(QString, locale);
        Screen::window()->resize(size);
        setLanguage(locale);
        QVERIFY(show(view));
        QTRY_COMPARE(Screen::views()->stage()->size(), QSizeF(size));
        QVERIFY(Screen::isDrawn());
        verifyScreen(locale);
        Screen::views()->closePopup(view);
    }

    /// The screens that look different with what is heard, or with what goes on.
    void everythingFitsInEveryState_data()
    {
        QTest::addColumn<QString>("view");
        QTest::addColumn<QString>("source");
        QTest::addColumn<QVariantMap>("state");
        const auto row = [](const char* name, const char* view, const char* source, const QVariantMap& state) {
            QTest::newRow(name) << QString::fromLatin1(view) << QString::fromLatin1(source) << state;
        };
        const auto heard = [](int source) { return QVariantMap{{QStringLiteral("mainAudioSource"), source}}; };
        row("AM", "RADIO.Main", "GlobalSource", heard(0));
        row("satellite", "RADIO.Main", "GlobalSource", heard(2));
        row("DAB", "RADIO.Main", "GlobalSource", heard(3));
        row("presets being filled", "RADIO.Main", "FMTunerSource", {{QStringLiteral("autoStoreInProgress"), true}});
        row("seeking traffic", "RADIO.Main", "FMTunerSource", {{QStringLiteral("tpSeekInProgress"), true}});
        const QString longText =
            QStringLiteral("A text of several words that goes on for a while, as texts of the world do");
        row("voice session", "SYSTEM.Voice", "SpeechSource",
            {{QStringLiteral("sessionState"), 12}, {QStringLiteral("promptText"), longText}});
        row("spoken text", "SYSTEM.Voice", "SpeechSource",
            {{QStringLiteral("ttsSessionActive"), true}, {QStringLiteral("promptText"), longText}});
        row("announcement", "RADIO.Announcement", "FMTunerSource",
            {{QStringLiteral("announcementType"), 1}, {QStringLiteral("announcementText"), longText}});
        row("assistant", "PHONE.Assistant", "PhoneSource", {{QStringLiteral("siriActive"), true}});
        row("standby", "SYSTEM.Standby", "GlobalSource", {{QStringLiteral("powerOn"), false}});
        for (const char* const view : {"PHONE.Main", "PHONE.Keypad", "PHONE.Call", "RADIO.Main"}) {
            row(qPrintable(QStringLiteral("emergency on %1").arg(QLatin1String(view))), view, "EAPhoneSource",
                {{QStringLiteral("eventsBlocked"), true}});
            row(qPrintable(QStringLiteral("call on %1").arg(QLatin1String(view))), view, "PhoneSource",
                {{QStringLiteral("callConnected"), true},
                 {QStringLiteral("callDuration"), 36000},
                 {QStringLiteral("privateMode"), true}});
        }
        for (const char* const view :
             {"MEDIA.Main", "SYSTEM.Launcher", "SYSTEM.AudioSources", "SYSTEM.Projection", "APPS.Main"}) {
            row(qPrintable(QStringLiteral("player on %1").arg(QLatin1String(view))), view, "GlobalSource", heard(16));
            row(qPrintable(QStringLiteral("disc on %1").arg(QLatin1String(view))), view, "GlobalSource", heard(4));
            row(qPrintable(QStringLiteral("phone on %1").arg(QLatin1String(view))), view, "GlobalSource", heard(35));
        }
    }

    void everythingFitsInEveryState()
    {
        QFETCH(QString, view);
        QFETCH(QString, source);
        QFETCH(QVariantMap, state);
        QVERIFY(BridgeTester::setState("ProjectionSource",
                                       {{"projectionMode", 2}, {"projectedDeviceName", QStringLiteral("A phone")}}));
        QVERIFY(BridgeTester::setState(source, state));
        for (const QSize& size : {QSize(1280, 720), QSize(800, 480)}) {
            for (const char* const locale : locales) {
                Screen::window()->resize(size);
                setLanguage(QString::fromLatin1(locale));
                QVERIFY(show(view));
                QTRY_COMPARE(Screen::views()->stage()->size(), QSizeF(size));
                QVERIFY(Screen::isDrawn());
                verifyScreen(QString::fromLatin1(locale));
                Screen::views()->closePopup(view);
            }
        }
    }

    /// Messages of every kind in the list, and one that is open and one that is answered.
    void everythingFitsWithMessages_data()
    {
        QTest::addColumn<QString>("view");
        QTest::addColumn<bool>("answered");
        QTest::newRow("list") << QStringLiteral("MESSAGES.Main") << false;
        QTest::newRow("open") << QStringLiteral("MESSAGES.Detail") << false;
        QTest::newRow("answered") << QStringLiteral("MESSAGES.Detail") << true;
        QTest::newRow("marks") << QStringLiteral("SYSTEM.Launcher") << false;
    }

    void everythingFitsWithMessages()
    {
        QFETCH(QString, view);
        QFETCH(bool, answered);
        auto* const intents = HmiCore::HmiIntentManager::instance();
        for (int i = 0; i < 3; ++i)
            QVERIFY(intents->requestAction(ModuleIntent::AddMessage,
                                           {QStringLiteral("Person %1").arg(i), QStringLiteral("What there is to say"),
                                            QStringLiteral("+49 30 5551"), QStringLiteral("Merrow Castle")}));
        QVERIFY(show(QStringLiteral("MESSAGES.Main")));
        QVERIFY(Screen::tap("message0"));
        QVERIFY(Screen::shows("MESSAGES.Detail"));
        if (answered)
            QVERIFY(Screen::tap("answer0"));
        for (const QSize& size : {QSize(1280, 720), QSize(800, 480)}) {
            for (const char* const locale : locales) {
                Screen::window()->resize(size);
                setLanguage(QString::fromLatin1(locale));
                QVERIFY(show(view));
                QTRY_COMPARE(Screen::views()->stage()->size(), QSizeF(size));
                QVERIFY(Screen::isDrawn());
                verifyScreen(QString::fromLatin1(locale));
            }
        }
        for (int i = 0; i < 3; ++i) {
            QVERIFY(show(QStringLiteral("MESSAGES.Main")));
            QVERIFY(Screen::tap("message0"));
            QVERIFY(Screen::tap("messageRemove"));
        }
        QVERIFY(Screen::shows("MESSAGES.Main"));
    }

    /// With guidance there is a turn on every screen, and more on those of the navigation.
    void everythingFitsOnTheWay_data()
    {
        QTest::addColumn<QString>("view");
        for (const char* const view : {"NAVIGATION.Main", "NAVIGATION.Route", "SYSTEM.Launcher", "PHONE.Main"})
            QTest::newRow(view) << QString::fromLatin1(view);
    }

    void everythingFitsOnTheWay()
    {
        QFETCH(QString, view);
        QVERIFY(HmiCore::HmiIntentManager::instance()->requestAction(HmiCore::HmiIntentManager::Navigate,
                                                                     {QStringLiteral("Ferry Terminal")}));
        QVERIFY(Screen::shows("NAVIGATION.Main"));
        for (const QSize& size : {QSize(1280, 720), QSize(800, 480)}) {
            for (const char* const locale : locales) {
                Screen::window()->resize(size);
                setLanguage(QString::fromLatin1(locale));
                QVERIFY(show(view));
                QTRY_COMPARE(Screen::views()->stage()->size(), QSizeF(size));
                QVERIFY(Screen::isDrawn());
                verifyScreen(QString::fromLatin1(locale));
            }
        }
        QVERIFY(show(QStringLiteral("NAVIGATION.Main")));
        QVERIFY(Screen::tap("stopGuidance"));
    }

    void noticesFit_data()
    {
        QTest::addColumn<QString>("notice");
        QTest::addColumn<bool>("voice");
        QTest::newRow("volume") << QStringLiteral("SYSTEM.Volume") << false;
        QTest::newRow("volume of the voice") << QStringLiteral("SYSTEM.Volume") << true;
        QTest::newRow("connection") << QStringLiteral("SYSTEM.Connection") << false;
        QTest::newRow("climate") << QStringLiteral("CLIMATE.Change") << false;
        QTest::newRow("message") << QStringLiteral("MESSAGES.Arrived") << false;
        QTest::newRow("turn") << QStringLiteral("NAVIGATION.Turn") << false;
        QTest::newRow("failed request") << QStringLiteral("SYSTEM.Notice") << false;
    }

    void noticesFit()
    {
        QFETCH(QString, notice);
        QFETCH(bool, voice);
        QVERIFY(BridgeTester::setState("SpeechSource", {{"ttsSessionActive", voice}}));
        auto* const statusBar = HmiGuiFramework::DataStore::get<HmiGuiFramework::StatusBarController>(
            QStringLiteral("StatusBarController"));
        for (const QSize& size : {QSize(1280, 720), QSize(800, 480)}) {
            for (const char* const locale : locales) {
                Screen::window()->resize(size);
                setLanguage(QString::fromLatin1(locale));
                QVERIFY(statusBar->transient() != QLatin1String("SYSTEM.Notice")); // it was in another language
                HmiCore::HmiIntentManager::instance()->requestAction(HmiCore::HmiIntentManager::ResumeMediaPlayback);
                m_log->take(QStringLiteral("kest.hmicore"), QtWarningMsg);
                QTRY_COMPARE(statusBar->transient(), QStringLiteral("SYSTEM.Notice")); // from now on it has a text
                statusBar->requestTransientWidget(notice, 60000);
                QTRY_COMPARE(Screen::views()->stage()->size(), QSizeF(size));
                QVERIFY(Screen::isDrawn());
                QVERIFY(Screen::find("transient"));
                verifyScreen(QString::fromLatin1(locale));
            }
        }
        statusBar->dismissTransient();
    }

    void barsShowWhereAListIs_data()
    {
        QTest::addColumn<QString>("locale");
        QTest::addColumn<bool>("isAtTheRight");
        QTest::newRow("left to right") << QStringLiteral("de_DE") << true;
        QTest::newRow("right to left") << QStringLiteral("ar_SA") << false;
    }

    void barsShowWhereAListIs()
    {
        QFETCH(QString, locale);
        Screen::window()->resize(800, 480);
        setLanguage(locale);
        QVERIFY(show(QStringLiteral("RADIO.Stations")));
        QQuickItem* const list = Screen::find("stationList");
        const QQuickItem* const bar = Screen::find("scrollBar");
        QVERIFY(list && bar);
        const auto place = [&] { return bar->mapRectToItem(list, QRectF(0, 0, bar->width(), bar->height())); };
        QTEST(place().center().x() > list->width() / 2, "isAtTheRight");
        QCOMPARE(place().top(), 0.0);
        QVERIFY(QMetaObject::invokeMethod(list, "positionViewAtEnd"));
        QTRY_VERIFY(list->property("atYEnd").toBool());
        QTRY_COMPARE(qRound(place().bottom()), qRound(list->height()));
    }

    void countsHaveTheFormThatTheLanguageAsksFor_data()
    {
        QTest::addColumn<QString>("locale");
        QTest::addColumn<int>("tracks");
        QTest::addColumn<QString>("hint");
        const auto row = [](const char* locale, int tracks, const char* hint) {
            QTest::addRow("%s %d", locale, tracks) << QString::fromLatin1(locale) << tracks << QString::fromUtf8(hint);
        };
        row("en_US", 1, "1 track");
        row("en_US", 12, "12 tracks");
        row("de_DE", 12, "12 Titel");
        row("fr_FR", 0, "0 piste");
        row("fr_FR", 2, "2 pistes");
        row("es_MX", 1, "1 pista");
        row("ar_SA", 1, "مقطع واحد");
        row("ar_SA", 2, "مقطعان");
        row("ar_SA", 7, "7 مقاطع");
        row("ar_SA", 12, "12 مقطعًا");
        row("ar_SA", 0, "لا توجد مقاطع");
        row("zh_CN", 12, "12 首");
        row("zh_TW", 1, "1 首");
    }

    void countsHaveTheFormThatTheLanguageAsksFor()
    {
        QFETCH(QString, locale);
        QFETCH(int, tracks);
        setLanguage(locale);
        QVERIFY(BridgeTester::setState("CDSource", {{"discTitle", QString()}, {"trackCount", tracks}}));
        QVERIFY(show(QStringLiteral("SYSTEM.AudioSources")));
        QVERIFY(Screen::isDrawn());
        const auto hintOfTheDisc = [] {
            QString hint;
            Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
                if (item->property("icon") == QLatin1String("disc") && item->property("subtitle").isValid())
                    hint = item->property("subtitle").toString();
            });
            return hint;
        };
        QTEST(hintOfTheDisc(), "hint");
        Screen::views()->closePopup(QStringLiteral("SYSTEM.AudioSources"));
    }

    void everyTextIsPlain()
    {
        for (const auto& view : Screen::views()->guiDescriptor().views) {
            QVERIFY(show(view.identifier));
            Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
                if (item->inherits("QQuickText"))
                    QVERIFY2(item->property("textFormat").toInt() == Qt::PlainText, qPrintable(Screen::pathOf(item)));
            });
        }
    }
};

int main(int argc, char** argv)
{
    return runInHeadUnit<ScreensTest>(argc, argv);
}

#include "tst_screens.moc"
