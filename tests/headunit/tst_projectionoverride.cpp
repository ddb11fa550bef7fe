// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "logcapture.h"
#include "screen.h"

#include <AL2HMIBridge/LanguageModel>
#include <HmiCore/HmiActivationOverrideManager>

#include <memory>

using AL2HMIBridge::BridgeTester;
using HmiCore::HmiActivationOverrideManager;

/// A phone that projects its screen takes the tiles of phone and navigation over, and gives them back.
class ProjectionOverrideTest : public QObject
{
    Q_OBJECT

    static QString text(const char* utf8) { return QString::fromUtf8(utf8); }

    static void project(int mode, const char* name = "Dana's phone")
    {
        QVERIFY(BridgeTester::setState("ProjectionSource",
                                       {{"projectionMode", mode}, {"projectedDeviceName", text(name)}}));
    }

    static QString name(const char* tile) { return Screen::find(tile)->property("name").toString(); }

    static QString icon(const char* tile) { return Screen::find(tile)->property("iconUrl").toUrl().toString(); }

    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_vehicle = std::make_unique<BridgeTester>();
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        QCOMPARE(name("tilePHONE"), text("Phone"));
    }

    void cleanup()
    {
        project(0);
        m_vehicle.reset();
        Screen::views()->requestView(text("SYSTEM.Launcher"));
        m_log.reset();
    }

    void namesAndIconsAreThePhonesWhileItIsThere()
    {
        const QString phone = icon("tilePHONE");
        const QString navigation = icon("tileNAVIGATION");
        const QString navigationName = name("tileNAVIGATION");
        project(1);
        QCOMPARE(name("tilePHONE"), text("Dana's phone"));
        QCOMPARE(name("tileNAVIGATION"), text("Maps"));
        QCOMPARE(icon("tilePHONE"), text("image://hmiimages/projection-phone"));
        QCOMPARE(icon("tileNAVIGATION"), text("image://hmiimages/projection-navigation"));
        QCOMPARE(Screen::find("railPHONE")->property("label").toString(), text("Dana's phone"));
        project(0);
        QCOMPARE(name("tilePHONE"), text("Phone"));
        QCOMPARE(name("tileNAVIGATION"), navigationName);
        QCOMPARE(icon("tilePHONE"), phone);
        QCOMPARE(icon("tileNAVIGATION"), navigation);
    }

    void anotherPhoneIsCalledDifferently()
    {
        project(1);
        project(2, "Robin's");
        QCOMPARE(name("tilePHONE"), text("Robin's"));
        project(2, "");
        QCOMPARE(name("tilePHONE"), text("Phone")); // one without a name
        QCOMPARE(icon("tilePHONE"), text("image://hmiimages/projection-phone"));
    }

    void theNamesAreInTheLanguageOfTheScreen()
    {
        const auto language = [](const char* locale) {
            return AL2HMIBridge::LanguageModel::instance()->idForLocale(text(locale));
        };
        project(1);
        BridgeTester::setState("GlobalSource", {{"destinationCountry", 2}, {"systemLanguage", language("de_DE")}});
        QTRY_COMPARE(name("tileNAVIGATION"), text("Karten"));
        BridgeTester::setState("GlobalSource", {{"systemLanguage", language("en_US")}});
        QTRY_COMPARE(name("tileNAVIGATION"), text("Maps"));
    }

    void thePressLeadsToThePhonesScreen()
    {
        project(1);
        for (const char* const tile : {"tilePHONE", "tileNAVIGATION", "railPHONE"}) {
            QVERIFY(Screen::tap(tile));
            QVERIFY(Screen::shows("SYSTEM.Projection"));
            Screen::views()->requestView(text("SYSTEM.Launcher"));
            QVERIFY(Screen::shows("SYSTEM.Launcher"));
        }
        QVERIFY(Screen::tap("tileMEDIA")); // which nobody claims
        QVERIFY(Screen::shows("MEDIA.Main"));
        project(0);
        Screen::views()->requestView(text("SYSTEM.Launcher"));
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        QVERIFY(Screen::tap("tilePHONE"));
        QVERIFY(Screen::shows("PHONE.Main"));
    }
};

int main(int argc, char** argv)
{
    return runInHeadUnit<ProjectionOverrideTest>(argc, argv);
}

#include "tst_projectionoverride.moc"
