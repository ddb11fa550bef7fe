// SPDX-License-Identifier: MIT
#include "logcapture.h"

#include <HmiVehicle/keycatalogue.h>
#include <HmiVehicle/vehicle.h>

#include <QRegularExpression>
#include <QSet>
#include <QTest>

#include <memory>

using namespace HmiVehicle;

using Events = QStringList; ///< "89:0", combinations as "c7:5"

/// What fingers do, and which key states leave for it.
class KeyInputTest : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<LogCapture> m_log;
    std::unique_ptr<Vehicle> m_vehicle;
    Events m_events;
    const KeyInput::Owner m_panel = KeyInput::newOwner();
    const KeyInput::Owner m_keyboard = KeyInput::newOwner();

    void make(bool frozen)
    {
        Vehicle::Options options;
        options.frozen = frozen;
        m_vehicle = std::make_unique<Vehicle>(options, [](Channel, const QByteArray&) {});
        Vehicle::Observer observer;
        observer.keySent = [this](int key, int state) { m_events.append(QStringLiteral("%1:%2").arg(key).arg(state)); };
        observer.combinationSent = [this](int id, int state) {
            m_events.append(QStringLiteral("c%1:%2").arg(id).arg(state));
        };
        m_vehicle->setObserver(observer);
    }

    KeyInput& keys() { return m_vehicle->keys(); }
    Events take() { return std::exchange(m_events, Events()); }
    static Events list(const char* events) { return QString::fromLatin1(events).split(QLatin1Char(' ')); }

private Q_SLOTS:
    void init()
    {
        m_log = std::make_unique<LogCapture>();
        m_events.clear();
        make(false);
    }

    void cleanup()
    {
        m_vehicle.reset();
        m_log.reset();
    }

    void aShortPressEndsBeforeTheLongPressTime()
    {
        QVERIFY(keys().press(89, m_panel));
        QVERIFY(keys().isDown(89));
        QCOMPARE(take(), list("89:0"));
        m_vehicle->advance(799);
        QVERIFY(m_events.isEmpty());
        QVERIFY(keys().release(89, m_panel));
        QVERIFY(!keys().isDown(89));
        QCOMPARE(take(), list("89:2"));
        m_vehicle->advance(10000);
        QVERIFY(m_events.isEmpty());
    }

    void aLongPressIsToldWhenItsTimeIsOver()
    {
        keys().press(8, m_panel);
        m_vehicle->advance(800);
        QCOMPARE(take(), list("8:0 8:3"));
        m_vehicle->advance(60000);
        QVERIFY(m_events.isEmpty());
        keys().release(8, m_panel);
        QCOMPARE(take(), list("8:4"));
    }

    void aFrozenVehicleTimesKeysByAdvance()
    {
        make(true);
        keys().press(8, m_panel);
        QCOMPARE(take(), list("8:0"));
        m_vehicle->advance(800);
        QCOMPARE(take(), list("8:3"));
        keys().release(8, m_panel);
        QCOMPARE(take(), list("8:4"));
    }

    void timesCanBeChangedForAllAndForOneKey()
    {
        keys().setLongPressTime(500);
        keys().setLongPressTime(22, 2000);
        QCOMPARE(keys().longPressTime(23), 500);
        keys().press(22, m_panel);
        keys().press(23, m_panel);
        m_vehicle->advance(500);
        QCOMPARE(take(), list("22:0 23:0 23:3"));
        m_vehicle->advance(1500);
        QCOMPARE(take(), list("22:3"));
    }

    void tuneKeysRepeatWhileTheyAreHeld()
    {
        keys().press(54, m_panel);
        m_vehicle->advance(1600);
        keys().release(54, m_panel);
        QCOMPARE(take(), list("54:0 54:3 54:1 54:1 54:4"));
        m_vehicle->advance(5000);
        QVERIFY(m_events.isEmpty());
    }

    void otherKeysRepeatWhenTheyAreToldTo()
    {
        QCOMPARE(keys().repeatInterval(6), 0);
        keys().setRepeatInterval(6, 100);
        keys().press(6, m_panel);
        m_vehicle->advance(1000);
        QCOMPARE(take(), list("6:0 6:3 6:1 6:1"));
    }

    void aDialSteps()
    {
        QVERIFY(keys().turn(54, 2, m_panel));
        QCOMPARE(take(), list("54:0 54:1 54:2 54:0 54:1 54:2"));
        QVERIFY(keys().turn(54, -1, m_panel));
        QCOMPARE(take(), list("55:0 55:1 55:2"));
        QVERIFY(keys().turn(9, -1, m_panel)); // a dial for the volume: its keys have no steps of their own
        QCOMPARE(take(), list("8:0 8:2"));
        m_vehicle->advance(5000);
        QVERIFY(m_events.isEmpty());
    }

    void stepsThatCannotBeAreRefused()
    {
        QVERIFY(!keys().turn(54, 0, m_panel));
        QVERIFY(!keys().turn(54, KeyInput::maximumSteps + 1, m_panel));
        QVERIFY(!keys().turn(54, -2147483647 - 1, m_panel));
        QVERIFY(!keys().turn(48, -1, m_panel));
        QVERIFY(!keys().turn(-1, 1, m_panel));
        keys().press(54, m_panel);
        take();
        QVERIFY(!keys().turn(54, 1, m_panel));
        QVERIFY(m_events.isEmpty());
    }

    void aPressBelongsToOneOwner()
    {
        QVERIFY(keys().press(89, m_panel));
        QVERIFY(!keys().press(89, m_keyboard));
        QVERIFY(!keys().press(89, m_panel));
        QVERIFY(!keys().release(89, m_keyboard));
        QCOMPARE(take(), list("89:0"));
        QVERIFY(keys().release(89, m_panel));
        QVERIFY(!keys().release(89, m_panel));
        QVERIFY(keys().press(89, m_keyboard));
        QCOMPARE(take(), list("89:2 89:0"));
    }

    void keysOfAnOwnerThatIsGoneComeUpAsHeldSoFar()
    {
        keys().press(6, m_keyboard);
        m_vehicle->advance(800);
        keys().press(7, m_keyboard);
        keys().press(89, m_panel);
        take();
        keys().releaseAll(m_keyboard);
        QCOMPARE(take(), list("6:4 7:2"));
        QVERIFY(keys().isDown(89));
    }

    void keysHeldTogetherCompleteACombination()
    {
        keys().press(48, m_panel);
        m_vehicle->advance(1000);
        keys().press(41, m_keyboard);
        take();
        m_vehicle->advance(2999);
        QCOMPARE(take(), list("41:3"));
        m_vehicle->advance(1);
        QCOMPARE(take(), list("c7:5"));
        m_vehicle->advance(60000);
        QVERIFY(m_events.isEmpty());
        keys().release(48, m_panel);
        keys().press(48, m_panel); // once more, with the other still held
        m_vehicle->advance(3000);
        QCOMPARE(take(), list("48:4 48:0 48:3 c7:5"));
    }

    void aCombinationThatIsLetGoTooEarlyIsNone()
    {
        keys().press(48, m_panel);
        keys().press(41, m_panel);
        m_vehicle->advance(2999);
        keys().release(41, m_panel);
        m_vehicle->advance(60000);
        QCOMPARE(take(), list("48:0 41:0 48:3 41:3 41:4"));
    }

    void unknownKeysArePassedOnAndImpossibleOnesAreNot()
    {
        QVERIFY(keys().press(200, m_panel));
        QVERIFY(keys().release(200, m_panel));
        QCOMPARE(take(), list("200:0 200:2"));
        QVERIFY(!keys().press(-1, m_panel));
        QVERIFY(!keys().press(KeyInput::largestKey + 1, m_panel));
    }

    void notMoreKeysThanFingersCanHold()
    {
        for (int key = 1000; key < 1000 + KeyInput::maximumHeld; ++key)
            QVERIFY(keys().press(key, m_panel));
        QVERIFY(!keys().press(5, m_panel));
        keys().releaseAll(m_panel);
        QVERIFY(keys().press(5, m_panel));
    }

    void everyKeyOfTheVehicleIsInTheCatalogue()
    {
        QList<int> ids;
        QSet<QString> names;
        for (const KeyInfo& key : KeyCatalogue::instance().keys()) {
            ids.append(key.id);
            names.insert(key.name);
            QVERIFY2(QRegularExpression(QStringLiteral("^[a-z][a-z0-9_]+$")).match(key.name).hasMatch(),
                     qPrintable(key.name));
            QVERIFY(!key.text.isEmpty());
            QCOMPARE(KeyCatalogue::instance().idFrom(key.name), key.id);
            QCOMPARE(KeyCatalogue::instance().find(key.id)->name, key.name);
            QVERIFY(!key.opposite || KeyCatalogue::instance().find(key.opposite)->opposite == key.id);
        }
        QCOMPARE(ids,
                 QList<int>({6,  7,  8,  9,  10, 12, 13, 15, 22, 23, 24, 25, 26,  27,  35,  41,  47,  48,  49,  50,
                             54, 55, 60, 77, 78, 79, 80, 83, 88, 89, 90, 91, 100, 101, 102, 103, 104, 105, 106, 110}));
        QCOMPARE(names.size(), ids.size());
        QCOMPARE(KeyCatalogue::instance().idFrom(QStringLiteral("200")), 200);
        for (const char* const wrong : {"", "-1", "x", "1.5", "99999999999"})
            QCOMPARE(KeyCatalogue::instance().idFrom(QString::fromLatin1(wrong)), -1);
        QCOMPARE(KeyCatalogue::instance().combinations().at(0).keys, QList<int>({48, 41}));
    }
};

QTEST_GUILESS_MAIN(KeyInputTest)
#include "tst_keyinput.moc"
