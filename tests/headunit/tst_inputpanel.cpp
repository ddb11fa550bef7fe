// SPDX-License-Identifier: MIT
#include "headunitmain.h"
#include "inputpanel.h"
#include "logcapture.h"
#include "screen.h"

#include <AL2HMIBridge/LanguageModel>
#include <HmiCore/HmiIntentManager>
#include <HmiCore/HmiIntentMonitor>
#include <HmiCore/HmiTranslationManager>
#include <HmiStateMachine/StateMachine>

#include <QGuiApplication>

#include <memory>

using AL2HMIBridge::BridgeTester;
using HmiCore::HmiIntentManager;

/// Texts are typed and written on the head unit's own keys and pad, as a person does.
class InputPanelTest : public QObject
{
    Q_OBJECT

    static constexpr int marketWithAllLanguages = 2;

    static QString text(const char* utf8) { return QString::fromUtf8(utf8); }

    static InputPanel* panel() { return qApp->findChild<InputPanel*>(); }

    static QString fieldText() { return Screen::text("textInput"); }

    static bool becomes(const QString& wanted)
    {
        return QTest::qWaitFor([&] { return fieldText() == wanted; });
    }

    /// What is in the field but not decided on.
    static QString preliminary() { return Screen::find("textInput")->property("preeditText").toString(); }

    static bool popup(const char* name)
    {
        return QTest::qWaitFor([name] { return Screen::views()->currentPopup() == text(name); })
               && (*name == '\0' || Screen::isDrawn());
    }

    static void setLanguage(const char* locale)
    {
        const int language = AL2HMIBridge::LanguageModel::instance()->idForLocale(text(locale));
        QVERIFY(BridgeTester::setState("GlobalSource",
                                       {{"destinationCountry", marketWithAllLanguages}, {"systemLanguage", language}}));
        QTRY_COMPARE(HmiCore::HmiTranslationManager::instance()->currentLanguageId(), text(locale));
    }

    /// The key that types \a label now.
    static QQuickItem* key(const QString& label)
    {
        QQuickItem* found = nullptr;
        Screen::visit(Screen::views()->stage(), [&](QQuickItem* item) {
            if (item->property("typed").toString() == label)
                found = item;
        });
        return found;
    }

    static QPoint middleOf(const QQuickItem* item)
    {
        return item->mapToScene(QPointF(item->width() / 2, item->height() / 2)).toPoint();
    }

    /// Presses the keys of these characters, one after the other; fails when one is not there.
    static bool type(const QString& characters)
    {
        for (const QChar character : characters) {
            if (!Screen::isDrawn())
                return false;
            const QQuickItem* const item = key(character);
            if (!item) {
                qWarning("there is no key %s", qPrintable(QString(character)));
                return false;
            }
            QTest::mouseClick(Screen::window(), Qt::LeftButton, Qt::NoModifier, middleOf(item));
        }
        return true;
    }

    /// Draws strokes in a box of the pad; points are in per cent of it.
    static bool write(const QVector<QVector<QPoint>>& strokes, int box = 0)
    {
        if (!Screen::isDrawn())
            return false;
        const QQuickItem* const pad = Screen::find("writingArea");
        const QSizeF size(pad->width() / panel()->boxes(), pad->height());
        for (const QVector<QPoint>& stroke : strokes) {
            QVector<QPoint> onScreen;
            for (const QPoint& point : stroke)
                onScreen.append(
                    pad->mapToScene(QPointF((point.x() / 100.0 + box) * size.width(), point.y() * size.height() / 100))
                        .toPoint());
            QTest::mousePress(Screen::window(), Qt::LeftButton, Qt::NoModifier, onScreen.constFirst());
            for (const QPoint& point : std::as_const(onScreen))
                QTest::mouseMove(Screen::window(), point);
            QTest::mouseRelease(Screen::window(), Qt::LeftButton, Qt::NoModifier, onScreen.constLast());
        }
        return true;
    }

    static bool offers(const char* candidate)
    {
        return QTest::qWaitFor([candidate] { return panel()->candidates().contains(text(candidate)); }, 30000);
    }

    static bool choose(const char* candidate)
    {
        const auto index = panel()->candidates().indexOf(text(candidate));
        return index >= 0 && Screen::tap(qPrintable(QStringLiteral("candidate%1").arg(index)));
    }

    static bool openSearch()
    {
        return Screen::views()->requestView(text("SYSTEM.Search")) && Screen::shows("SYSTEM.Search")
               && Screen::tap("searchField") && popup("SYSTEM.InputPanel");
    }

    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<BridgeTester> m_vehicle;

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_vehicle = std::make_unique<BridgeTester>();
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        setLanguage("en_US");
        QVERIFY(openSearch());
        QCOMPARE(fieldText(), QString());
        BridgeTester::takeCalls();
    }

    void cleanup()
    {
        if (panel()->isWriting())
            panel()->press(text("keys"));
        panel()->press(text("hide"));
        m_vehicle.reset();
        Screen::views()->requestView(text("SYSTEM.Launcher"));
        QVERIFY(Screen::shows("SYSTEM.Launcher"));
        m_log.reset();
    }

    void typesIntoTheFieldThatHasTheFocus()
    {
        QVERIFY(type(text("H")));
        QVERIFY(type(text("ello")));
        QVERIFY(becomes(text("Hello")));
        QVERIFY(Screen::tap("key_space"));
        QVERIFY(type(text("you")));
        QVERIFY(becomes(text("Hello you")));
    }

    void hidesAndComesBack()
    {
        QVERIFY(Screen::tap("key_hide"));
        QVERIFY(popup(""));
        QVERIFY(Screen::tap("searchField"));
        QVERIFY(popup("SYSTEM.InputPanel"));
    }

    void goesWithTheScreen()
    {
        Screen::views()->requestView(text("SYSTEM.Launcher"));
        QVERIFY(popup(""));
        QVERIFY(!panel()->isOpen());
    }

    void enterIsTheField()
    {
        QVERIFY(type(text("A")));
        QSignalSpy accepted(Screen::find("searchField"), SIGNAL(accepted()));
        QVERIFY(Screen::tap("key_enter"));
        QCOMPARE(accepted.count(), 1);
    }

    void shiftIsForALetterOrStays()
    {
        QVERIFY(type(text("A"))); // the first letter is a capital by itself
        QVERIFY(Screen::tap("key_shift"));
        QVERIFY(type(text("B")));
        QVERIFY(type(text("c")));
        QVERIFY(Screen::tap("key_shift"));
        QVERIFY(Screen::tap("key_shift"));
        QVERIFY(type(text("DE")));
        QVERIFY(Screen::tap("key_shift"));
        QVERIFY(type(text("f")));
        QVERIFY(becomes(text("ABcDEf")));
    }

    void aSentenceBeginsWithACapital()
    {
        QVERIFY(type(text("No.")));
        QVERIFY(Screen::tap("key_space"));
        QVERIFY(type(text("Yes")));
        QVERIFY(becomes(text("No. Yes")));
    }

    void backspaceRepeatsAsLongAsItIsHeld()
    {
        QVERIFY(type(text("Abcdefgh")));
        QVERIFY(Screen::tap("key_backspace"));
        QVERIFY(becomes(text("Abcdefg")));
        QTest::mousePress(Screen::window(), Qt::LeftButton, Qt::NoModifier, middleOf(Screen::find("key_backspace")));
        QVERIFY(becomes(QString()));
        QTest::mouseRelease(Screen::window(), Qt::LeftButton, Qt::NoModifier, middleOf(Screen::find("key_backspace")));
        QCOMPARE(fieldText(), QString());
    }

    void aWholeCharacterGoesAtOnce()
    {
        panel()->type(text("a"));
        panel()->type(QStringLiteral("\U0001F697")); // two UTF-16 units
        panel()->type(text("e\u0301"));              // with a combining accent
        QVERIFY(Screen::tap("key_backspace"));
        QVERIFY(Screen::tap("key_backspace"));
        const QString left = fieldText();
        QVERIFY2(left == text("a") || left == QStringLiteral("a\U0001F697"), qPrintable(left)); // accents go one by one
        for (const QChar character : left)
            QVERIFY(!character.isLowSurrogate() || left.size() == 3);
    }

    void aHeldKeyOffersItsRelatives()
    {
        QVERIFY(type(text("P")));
        const QPoint e = middleOf(key(text("e")));
        QTest::mousePress(Screen::window(), Qt::LeftButton, Qt::NoModifier, e);
        QVERIFY(offers("é"));
        QTest::mouseRelease(Screen::window(), Qt::LeftButton, Qt::NoModifier, e);
        QVERIFY(choose("é"));
        QVERIFY(becomes(text("Pé")));
        QCOMPARE(panel()->candidates(), QStringList());
        QVERIFY(type(text("r")));
        QVERIFY(becomes(text("Pér")));
    }

    void symbolsAndBack()
    {
        QVERIFY(Screen::tap("key_symbols"));
        QVERIFY(type(text("42%")));
        QVERIFY(Screen::tap("key_letters"));
        QVERIFY(type(text("x")));
        QVERIFY(becomes(text("42%x")));
    }

    void theLanguageChoosesTheKeys_data()
    {
        QTest::addColumn<QString>("locale");
        QTest::addColumn<QString>("layout");
        QTest::addColumn<QString>("next");
        QTest::addColumn<bool>("canWrite");
        QTest::newRow("English") << "en_US"
                                 << "Latin"
                                 << "Latin" << true;
        QTest::newRow("German") << "de_DE"
                                << "LatinQwertz"
                                << "LatinQwertz" << true;
        QTest::newRow("French") << "fr_FR"
                                << "LatinAzerty"
                                << "LatinAzerty" << true;
        QTest::newRow("Spanish") << "es_MX"
                                 << "LatinSpanish"
                                 << "LatinSpanish" << true;
        QTest::newRow("Arabic") << "ar_SA"
                                << "Arabic"
                                << "Latin" << false;
        QTest::newRow("Simplified Chinese") << "zh_CN"
                                            << "Pinyin"
                                            << "Latin" << true;
        QTest::newRow("Traditional Chinese") << "zh_TW"
                                             << "Zhuyin"
                                             << "Latin" << true;
    }
    void theLanguageChoosesTheKeys()
    {
        QFETCH(QString, locale);
        QFETCH(QString, layout);
        QFETCH(QString, next);
        QFETCH(bool, canWrite);
        setLanguage(qPrintable(locale));
        QCOMPARE(panel()->layout(), layout);
        QCOMPARE(panel()->canWrite(), canWrite);
        QCOMPARE(panel()->hasOtherLayouts(), next != layout);
        QVERIFY(HmiIntentManager::instance()->requestAction(HmiIntentManager::ChangeKeyboardLayout));
        QTRY_COMPARE(panel()->layout(), next);
    }

    void withoutAFieldThereIsNoLayoutToChange()
    {
        QVERIFY(HmiIntentManager::instance()->intentMonitor(HmiIntentManager::ChangeKeyboardLayout)->enabled());
        QVERIFY(Screen::tap("key_hide"));
        QTRY_VERIFY(!HmiIntentManager::instance()->intentMonitor(HmiIntentManager::ChangeKeyboardLayout)->enabled());
    }

    void pinyinBecomesWords()
    {
        setLanguage("zh_CN");
        QVERIFY(type(text("nihao")));
        QTRY_COMPARE(preliminary(), text("nihao"));
        QVERIFY(offers("你好"));
        QVERIFY(choose("你好"));
        QVERIFY(becomes(text("你好")));
        QVERIFY(type(text("ni")));
        QVERIFY(Screen::tap("key_space")); // the first candidate
        QVERIFY(becomes(text("你好你")));
    }

    void lettersStayLettersWithEnter()
    {
        setLanguage("zh_CN");
        QVERIFY(type(text("ni")));
        QVERIFY(Screen::tap("key_enter"));
        QVERIFY(becomes(text("ni")));
        QCOMPARE(preliminary(), QString());
    }

    void punctuationComesAfterWhatWasBegun()
    {
        setLanguage("zh_CN");
        QVERIFY(type(text("ni，")));
        QVERIFY(becomes(text("你，")));
    }

    void backspaceTakesWhatIsBegunFirst()
    {
        setLanguage("zh_CN");
        QVERIFY(type(text("nihao")));
        QVERIFY(offers("你好"));
        QVERIFY(choose("你好"));
        QVERIFY(type(text("ma")));
        QVERIFY(Screen::tap("key_backspace"));
        QTRY_COMPARE(preliminary(), text("m"));
        QVERIFY(Screen::tap("key_backspace"));
        QTRY_COMPARE(preliminary(), QString());
        QCOMPARE(fieldText(), text("你好"));
        QVERIFY(Screen::tap("key_backspace"));
        QVERIFY(becomes(text("你")));
    }

    void zhuyinBecomesWords()
    {
        setLanguage("zh_TW");
        QVERIFY(type(text("ㄋㄧˇㄏㄠˇ")));
        QVERIFY(offers("你好"));
        QVERIFY(choose("你好"));
        QVERIFY(becomes(text("你好")));
    }

    void spaceIsTheFirstToneOfASyllable()
    {
        setLanguage("zh_TW");
        QVERIFY(type(text("ㄊㄚ")));
        QVERIFY(Screen::tap("key_space"));
        QVERIFY(offers("他"));
        QVERIFY(Screen::tap("key_space"));
        QTRY_COMPARE(fieldText().size(), 1);
    }

    void aCharacterIsWrittenByHand_data()
    {
        QTest::addColumn<QString>("locale");
        QTest::newRow("Simplified") << "zh_CN";
        QTest::newRow("Traditional") << "zh_TW";
    }
    void aCharacterIsWrittenByHand()
    {
        QFETCH(QString, locale);
        setLanguage(qPrintable(locale));
        QVERIFY(Screen::tap("key_writing"));
        QVERIFY(write({{{12, 45}, {50, 44}, {88, 43}}, {{50, 12}, {50, 50}, {50, 90}}}));
        QVERIFY(offers("十"));
        QVERIFY(!preliminary().isEmpty());
        QVERIFY(choose("十"));
        QVERIFY(becomes(text("十")));
        QTRY_COMPARE(preliminary(), QString());
        QVERIFY(write({{{12, 50}, {50, 49}, {88, 48}}}));
        QVERIFY(offers("一"));
        QVERIFY(choose("一"));
        QVERIFY(becomes(text("十一")));
    }

    void lettersAreWrittenOneAfterTheOther()
    {
        QVERIFY(Screen::tap("key_writing"));
        QVERIFY(write({{{30, 10}, {30, 50}, {30, 85}, {50, 86}, {70, 86}}}));
        QVERIFY(offers("L"));
        QVERIFY(choose("L"));
        QVERIFY(becomes(text("L")));
        QVERIFY(write({{{25, 15}, {50, 15}, {75, 15}}, {{50, 15}, {50, 50}, {50, 85}}}));
        QSignalSpy rested(panel(), &InputPanel::handRested);
        QVERIFY(rested.wait());
        QVERIFY(offers("T"));
        const QString first = preliminary();
        QVERIFY(write({{{30, 10}, {30, 50}, {30, 85}, {50, 86}, {70, 86}}})); // which takes what was written before
        QVERIFY(becomes(text("L") + first));
        QVERIFY(offers("L"));
    }

    void eachBoxIsForACharacter()
    {
        setLanguage("zh_CN");
        QVERIFY(Screen::tap("key_writing"));
        QVERIFY(panel()->boxes() > 1);
        QVERIFY(write({{{12, 45}, {50, 44}, {88, 43}}, {{50, 12}, {50, 50}, {50, 90}}}, 0));
        QVERIFY(offers("十"));
        const QString first = preliminary();
        QVERIFY(write({{{12, 50}, {50, 49}, {88, 48}}}, 1));
        QVERIFY(becomes(first));
        QVERIFY(offers("一"));
        QVERIFY(choose("一"));
        QVERIFY(becomes(first + text("一")));
    }

    void backspaceWipesThePadFirst()
    {
        setLanguage("zh_CN");
        QVERIFY(type(text("ni")));
        QVERIFY(Screen::tap("key_space"));
        QVERIFY(Screen::tap("key_writing"));
        QVERIFY(write({{{12, 50}, {50, 49}, {88, 48}}}));
        QVERIFY(offers("一"));
        QVERIFY(Screen::tap("key_backspace"));
        QTRY_COMPARE(panel()->candidates(), QStringList());
        QCOMPARE(fieldText(), text("你"));
        QVERIFY(Screen::tap("key_backspace"));
        QVERIFY(becomes(QString()));
    }

    void theLanguageChangesWhileSomethingIsWritten()
    {
        setLanguage("zh_CN");
        QVERIFY(Screen::tap("key_writing"));
        for (const char* const locale : {"zh_TW", "zh_CN", "ar_SA", "zh_TW", "zh_CN"}) {
            if (panel()->isWriting())
                QVERIFY(write({{{12, 50}, {50, 49}, {88, 48}}}));
            setLanguage(locale);
        }
        QVERIFY(!panel()->isWriting()); // there is no handwriting in Arabic
        QVERIFY(Screen::tap("key_writing"));
        QVERIFY(write({{{12, 50}, {50, 49}, {88, 48}}}));
        QVERIFY(offers("一"));
    }

    void aNumberFieldHasNumbers()
    {
        Screen::find("textInput")->setProperty("inputMethodHints", int(Qt::ImhDigitsOnly));
        QVERIFY(Screen::tap("key_hide"));
        QVERIFY(Screen::tap("searchField"));
        QVERIFY(popup("SYSTEM.InputPanel"));
        QCOMPARE(panel()->layout(), text("Numbers"));
        QVERIFY(!panel()->canWrite());
        QVERIFY(type(text("112")));
        QVERIFY(becomes(text("112")));
        Screen::find("textInput")->setProperty("inputMethodHints", int(Qt::ImhNone));
    }

    void nothingIsTypedWhileDriving()
    {
        QVERIFY(type(text("Abc")));
        BridgeTester::setState("GlobalSource", {{"vehicleSpeed", 4.9}});
        QCOMPARE(Screen::views()->currentPopup(), text("SYSTEM.InputPanel"));
        BridgeTester::setState("GlobalSource", {{"vehicleSpeed", 5.0}});
        QVERIFY(popup(""));
        QCOMPARE(fieldText(), text("Abc")); // nothing is lost
        QVERIFY(Screen::tap("searchField"));
        QVERIFY(popup(""));
        BridgeTester::setState("GlobalSource", {{"vehicleSpeed", 3.0}});
        QVERIFY(Screen::tap("searchField"));
        QVERIFY(popup(""));
        BridgeTester::setState("GlobalSource", {{"vehicleSpeed", 2.9}});
        QVERIFY(Screen::tap("searchField"));
        QVERIFY(popup("SYSTEM.InputPanel"));
    }

    void theFieldStaysInSight()
    {
        QCOMPARE(panel()->lift(), 0.0); // it is at the top
        const QQuickItem* const field = Screen::find("textInput");
        const double bottom = field->mapToScene(QPointF(0, field->height())).y();
        QVERIFY(bottom + panel()->height() < Screen::window()->height());
        const double height = panel()->height();
        panel()->setHeight(Screen::window()->height() - bottom + 50); // a keyboard that would hide it
        QCOMPARE(panel()->lift(), 50.0);
        QTRY_COMPARE(field->mapToScene(QPointF(0, field->height())).y(), bottom - 50);
        QCOMPARE(panel()->lift(), 50.0); // also when asked again
        QVERIFY(Screen::tap("key_hide"));
        QTRY_COMPARE(panel()->lift(), 0.0);
        panel()->setHeight(height);
    }

    void nothingThatIsTypedOrDrawnIsLogged()
    {
        m_log.reset();
        m_log = std::make_unique<LogCapture>(text("*.debug=true\nqt.*=false"));
        setLanguage("zh_CN");
        QVERIFY(type(text("zhongguo")));
        QVERIFY(offers("中国"));
        QVERIFY(choose("中国"));
        QVERIFY(Screen::tap("key_writing"));
        QVERIFY(write({{{12, 45}, {50, 44}, {88, 43}}, {{50, 12}, {50, 50}, {50, 90}}}));
        QVERIFY(offers("十"));
        QVERIFY(choose("十"));
        QVERIFY(becomes(text("中国十")));
        const auto records = m_log->records();
        QVERIFY(!records.isEmpty());
        for (const auto& record : records)
            for (const char* const secret : {"zhong", "中", "十", "QPointF", "QVariant(QVariantList"})
                QVERIFY2(!record.message.contains(text(secret)), qPrintable(record.message));
    }

    void searchFindsContactsAndStations()
    {
        const auto record = [](const char* a, const char* x, const char* b, const char* y) {
            return QVariant(QVariantMap{{text(a), text(x)}, {text(b), text(y)}});
        };
        BridgeTester::setState("PhoneSource",
                               {{"contacts", QVariantList{record("name", "Mélanie Roux", "number", "+33 1 555"),
                                                          record("name", "Carmela", "number", "+49 30 77"),
                                                          record("name", "Ann Melville", "number", "12")}},
                                {"deviceName", text("A phone")}});
        BridgeTester::setState("FMTunerSource",
                               {{"stationList", QVariantList{record("name", "News", "frequency", "90.1"),
                                                             record("name", "Melody", "frequency", "94.3")}}});
        QVERIFY(type(text("Mel")));
        QTRY_COMPARE(Screen::find("searchResults")->property("count").toInt(), 4);
        QStringList names;
        for (const char* const row : {"result0", "result1"})
            names.append(Screen::find(row)->property("title").toString());
        QCOMPARE(names, (QStringList{text("Mélanie Roux"), text("Melody")}));
        QVERIFY(Screen::tap("result1"));
        QTRY_COMPARE(BridgeTester::calls().size(), 2);
        QCOMPARE(BridgeTester::takeCalls(),
                 (QStringList{text("FMTunerSource.tuneToStation(1)"), text("GlobalSource.setAudioSource(1, -1)")}));
    }
};

int main(int argc, char** argv)
{
    return runInHeadUnit<InputPanelTest>(argc, argv);
}

#include "tst_inputpanel.moc"
